// SPDX-License-Identifier: Apache-2.0
// The decoders of the LTE technology.
//
// To add one: write its table or class in a file of its own and add it below, as CONTRIBUTING.md shows. The
// order is the order of creation, and so the order in which the subscribers of one log code receive a record.
#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Daemon/PDPContextList.h"
#include "LogGenerator/Daemon/SimInfo.h"
#include "LogGenerator/LTE/LTEServingCellInfo.h"
#include "LogGenerator/LTE/LTETables.h"
#include "LogGenerator/LTE/NeighborCellsList.h"
#include "LogGenerator/LTE/ReselectionCandidatesList.h"

namespace kelvasi {

class LTEClassIndex : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;
  ~LTEClassIndex() override { deallocWith("Deallocing LTEClassIndex"); }

  LTEServingCellInfo& objLTEServingCellInfo = create<LTEServingCellInfo>();
  ConnectedModeMeasurementMisc& objConnectedModeMeasurementMisc = create<ConnectedModeMeasurementMisc>();
  MeasuredNeighborCells& objMeasuredNeighborCells = create<MeasuredNeighborCells>();
  DetectedCells& objDetectedCells = create<DetectedCells>();
  ServingCellMeasurement& objServingCellMeasurement = create<ServingCellMeasurement>();
  NeighborMeasurementMisc& objNeighborMeasurementMisc = create<NeighborMeasurementMisc>();
  NeighborCellsList& objNeighborCellsList = create<NeighborCellsList>();
  ReselectionCandidatesMisc& objReselectionCandidatesMisc = create<ReselectionCandidatesMisc>();
  ReselectionCandidatesList& objReselectionCandidatesList = create<ReselectionCandidatesList>();
  SimInfo& objSimInfo = create<SimInfo>();
  PDPContextList& objPDPContextList = create<PDPContextList>();
};

}  // namespace kelvasi
