// SPDX-License-Identifier: Apache-2.0
// The decoders of the GSM/UMTS technology.
//
// To add one: write its table or class in a file of its own and add it below, as CONTRIBUTING.md shows. The
// order is the order of creation, and so the order in which the subscribers of one log code receive a record;
// it is also the order of release.
#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Daemon/PDPContextList.h"
#include "LogGenerator/Daemon/SimInfo.h"
#include "LogGenerator/GSM/ActiveSet.h"
#include "LogGenerator/GSM/EquivalentPLMNList.h"
#include "LogGenerator/GSM/GSMTables.h"
#include "LogGenerator/GSM/NeighboringCells.h"
#include "LogGenerator/GSM/ServingPLMN.h"
#include "LogGenerator/GSM/UMTSRRInfo.h"

namespace kelvasi {

class Orvane_GSMClassIndex : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;
  ~Orvane_GSMClassIndex() override { deallocWith("Deallocing Orvane_GSMClassIndex"); }

  ActiveSet& objActiveSet = create<ActiveSet>();
  CodingScheme& objCodingScheme = create<CodingScheme>();
  GPRSInformation& objGPRSInformation = create<GPRSInformation>();
  GSMServingCell& objGSMServingCell = create<GSMServingCell>();
  MobileAllocation& objMobileAllocation = create<MobileAllocation>();
  NeighboringCells& objNeighboringCells = create<NeighboringCells>();
  PDPContextList& objPDPContextList = create<PDPContextList>();
  ProcessPS& objProcessPS = create<ProcessPS>();
  UMTSRRMeasurement& objUMTSRRMeasurement = create<UMTSRRMeasurement>();
  CellChangeCounters& objCellChangeCounter = create<CellChangeCounters>();
  DetectedSet& objDetectedSet = create<DetectedSet>();
  GSMSet& objGSMSet = create<GSMSet>();
  NonRankedGSMSet& objNonRankedGSMSet = create<NonRankedGSMSet>();
  ProcessCO& objProcessCO = create<ProcessCO>();
  ServingPLMN& objServingPLMN = create<ServingPLMN>();
  UMTSSet& objUMTSSet = create<UMTSSet>();
  EquivalentPLMNList& objEquivalentPLMNList = create<EquivalentPLMNList>();
  GSMRRInfo& objGSMRRInfo = create<GSMRRInfo>();
  MonitoredSet& objMonitoredSet = create<MonitoredSet>();
  NonRankedUMTSSet& objNonRankedUMTSSet = create<NonRankedUMTSSet>();
  ProcessCS& objProcessCS = create<ProcessCS>();
  UMTSRRInfo& objUMTSRRInfo = create<UMTSRRInfo>();
  BLER& objBLER = create<BLER>();
  VirtualActiveSet& objVirtualActiveSet = create<VirtualActiveSet>();
  SimInfo& objSimInfo = create<SimInfo>();
  HSDPAInformation& objHSDPAInformation = create<HSDPAInformation>();
};

}  // namespace kelvasi
