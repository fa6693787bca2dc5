// SPDX-License-Identifier: Apache-2.0
// The decoders of the UTRAN technology.
//
// To add one: write its table or class in a file of its own and add it below, as CONTRIBUTING.md shows. The
// order is the order of creation, and so the order in which the subscribers of one log code receive a record.
#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Daemon/PDPContextList.h"
#include "LogGenerator/Daemon/SimInfo.h"
#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"
#include "LogGenerator/UTRAN/RRC_State.h"
#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"
#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"
#include "LogGenerator/UTRAN/UTRANTables.h"

namespace kelvasi {

class UTRANClassIndex : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;

  RRC_State& rrc_state = create<RRC_State>();
  UTRANServingCellInfo& servingCellInfo = create<UTRANServingCellInfo>();
  UTRANNeighbhorMeasurements& tdMeasurements = create<UTRANNeighbhorMeasurements>();
  GSMNeighbhorMeasurements& gsmMeasurements = create<GSMNeighbhorMeasurements>();
  TRCHBLERMeasurement& trchMeasurements = create<TRCHBLERMeasurement>();
  CCTRCHSIRMeasurement& cctrchMeasurements = create<CCTRCHSIRMeasurement>();
  PDPContextList& pdpList = create<PDPContextList>();
  SimInfo& simInfo = create<SimInfo>();
};

}  // namespace kelvasi
