// SPDX-License-Identifier: Apache-2.0
// The sections of GSM/UMTS whose decoder is a table and nothing else. The records' own files have the rows.
#pragma once

#include <array>

#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/GSM/DaemonCells.h"
#include "LogGenerator/GSM/GMMState.h"
#include "LogGenerator/GSM/GPRSCellOptions.h"
#include "LogGenerator/GSM/GPRSRecords.h"
#include "LogGenerator/GSM/GSMCellRecords.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/GSMRRRecords.h"
#include "LogGenerator/GSM/HARQStatistics.h"
#include "LogGenerator/GSM/HoppingList.h"
#include "LogGenerator/GSM/MMState.h"
#include "LogGenerator/GSM/NeighbourSets.h"
#include "LogGenerator/GSM/RegisteredPLMN.h"
#include "LogGenerator/GSM/RegistrationState.h"
#include "LogGenerator/GSM/TransportChannelCRC.h"
#include "LogGenerator/ListDecoder.h"
#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

namespace gsmTables {

// Mobility management (3GPP TS 24.008, 4.1) of each domain, and what both have in common.
inline constexpr std::array csCodes{mmState::logCode, registrationState::logCode};
inline constexpr std::array csRecords{mmState::record, registrationState::serviceState};
inline constexpr StateSection processCS{
    .name = "Process CS", .trace = "ProcessCS", .logCodes = csCodes, .records = csRecords};

inline constexpr std::array psCodes{gmmState::logCode, registrationState::logCode};
inline constexpr std::array psRecords{gmmState::record, registrationState::serviceState};
inline constexpr StateSection processPS{
    .name = "Process PS", .trace = "ProcessPS", .logCodes = psCodes, .records = psRecords};

inline constexpr std::array coRecords{mmState::stateRecord, registrationState::serviceState};
// The trace names another section; tools that filter the system log know it so.
inline constexpr StateSection processCO{
    .name = "Process CO", .trace = "ProcessCS", .logCodes = csCodes, .records = coRecords};

// What the GSM serving cell offers for GPRS.
inline constexpr std::array gprsCodes{
    packetAccess::logCode, registeredPlmn::logCode, gprsCellOptions::logCode, pbcch::logCode,
    packetStatus::logCode, si13::logCode,           gsmMeasurements::logCode};
inline constexpr std::array gprsRecords{
    si13::record,  packetAccess::record, registeredPlmn::operatingMode, gprsCellOptions::record,
    pbcch::record, packetStatus::record, gsmMeasurements::hysteresis};
inline constexpr StateSection gprsInformation{
    .name = "GPRS Information", .trace = "GPRSInformation", .logCodes = gprsCodes, .records = gprsRecords};

// State and reception of GSM radio resource management.
inline constexpr std::array rrCodes{rrState::logCode, gsmMeasurements::logCode, dtx::logCode,
                                    gprsCellOptions::logCode};
inline constexpr std::array rrRecords{rrState::record, gsmMeasurements::reception, dtx::record,
                                      gprsCellOptions::drxRecord};
inline constexpr StateSection gsmRRInfo{.name = "GSM RR Info",
                                        .trace = "GSMRRInfo",
                                        .logCodes = rrCodes,
                                        .records = rrRecords,
                                        .role = CellRole::serving};

// Identity, channel and measurements of the GSM serving cell.
inline constexpr std::array cellCodes{gsmCellIdentity::logCode, gsmMeasurements::logCode,
                                      dedicatedChannel::logCode, cellInfoLogCode};
inline constexpr std::array cellRecords{gsmCellIdentity::record, gsmMeasurements::levels,
                                        dedicatedChannel::record};
inline constexpr StateSection gsmServingCell{.name = "GSM Serving Cell",
                                             .trace = "GSMServingCell",
                                             .logCodes = cellCodes,
                                             .records = cellRecords,
                                             .cells = &daemonCells::gsmServing,
                                             .role = CellRole::serving};

// The frequencies that the dedicated channel hops over.
inline constexpr std::array hoppingCodes{hoppingList::logCode};
inline constexpr std::array hoppingRecords{hoppingList::record};
inline constexpr StateSection mobileAllocation{.name = "Mobile Allocation",
                                               .trace = "MobileAllocation",
                                               .logCodes = hoppingCodes,
                                               .records = hoppingRecords};

// What the block error rate of each transport channel is made of.
inline constexpr std::array blerCodes{transportChannelCrc::logCode};
inline constexpr std::array blerRecords{transportChannelCrc::record};
inline constexpr StateSection bler{
    .name = "BLER", .trace = "BLER", .logCodes = blerCodes, .records = blerRecords};

// Statistics of the HARQ processes. Another code goes without a line in the system log.
inline constexpr std::array hsdpaCodes{harqStatistics::logCode};
inline constexpr std::array hsdpaRecords{harqStatistics::record};
inline constexpr StateSection hsdpaInformation{.name = "HSDPA Info",
                                               .trace = "HSDPA Info",
                                               .logCodes = hsdpaCodes,
                                               .records = hsdpaRecords,
                                               .isSilent = true};

// The cells ranked for reselection, and the UMTS neighbours of the cell list.
inline constexpr std::array gsmSetCodes{neighbourSets::logCode};
inline constexpr ListSection gsmSet{.name = "GSM Set",
                                    .trace = "GSMSet",
                                    .logCodes = gsmSetCodes,
                                    .logCode = neighbourSets::logCode,
                                    .minimumLength = neighbourSets::minimumLength,
                                    .list = neighbourSets::gsmCells,
                                    .rows = neighbourSets::gsmRows,
                                    .role = CellRole::neighbour,
                                    .cell = neighbourSets::gsmCell};

inline constexpr std::array umtsSetCodes{neighbourSets::logCode, cellInfoLogCode};
inline constexpr ListSection umtsSet{.name = "UMTS Set",
                                     .trace = "UMTSSet",
                                     .logCodes = umtsSetCodes,
                                     .logCode = neighbourSets::logCode,
                                     .minimumLength = neighbourSets::minimumLength,
                                     .list = neighbourSets::umtsCells,
                                     .rows = neighbourSets::umtsRows,
                                     .cells = &daemonCells::umtsNeighbours,
                                     .role = CellRole::neighbour,
                                     .cell = neighbourSets::umtsCell};

// Sets of WCDMA cells (3GPP TS 25.331, 8.4) that every cell-sets record empties and none fills.
constexpr ListSection hollowSet(std::string_view name, std::string_view trace) {
  return {.name = name,
          .trace = trace,
          .logCodes = cellSets::logCodes,
          .logCode = cellSets::logCode,
          .minimumLength = cellSets::minimumLength,
          .list = cellSets::identities,
          .staysEmpty = true};
}
inline constexpr ListSection detectedSet = hollowSet("Detected Set", "DetectedSet");
inline constexpr ListSection monitoredSet = hollowSet("Monitored Set", "MonitoredSet");
inline constexpr ListSection virtualActiveSet = hollowSet("Virtual Active Set", "VirtualActiveSet");

// Sections that ask for no records, so that they show what the template holds, and no record is unknown to
// them.
constexpr StateSection recordless(std::string_view name, std::string_view trace) {
  return {.name = name, .trace = trace, .logCodes = {}, .isSilent = true};
}
inline constexpr StateSection umtsRRMeasurement = recordless("UMTS RR Measurement", "UMTSRRMeasurement");
inline constexpr StateSection cellChangeCounters = recordless("Cell Change Counters", "CellChangeCounters");
// The trace names its sibling; tools that filter the system log know it so.
inline constexpr StateSection codingScheme = recordless("Coding Scheme", "CellChangeCounters");

constexpr ListSection recordlessList(std::string_view name, std::string_view trace) {
  return {.name = name, .trace = trace, .logCodes = {}, .list = {}, .isSilent = true};
}
inline constexpr ListSection nonRankedGSMSet = recordlessList("Non-Ranked GSM Set", "NonRankedGSMSet");
inline constexpr ListSection nonRankedUMTSSet = recordlessList("Non-Ranked UMTS Set", "NonRankedUMTSSet");

}  // namespace gsmTables

using BLER = StateTable<gsmTables::bler>;
using CellChangeCounters = StateTable<gsmTables::cellChangeCounters>;
using CodingScheme = StateTable<gsmTables::codingScheme>;
using DetectedSet = ListTable<gsmTables::detectedSet>;
using GPRSInformation = StateTable<gsmTables::gprsInformation>;
using GSMRRInfo = StateTable<gsmTables::gsmRRInfo>;
using GSMServingCell = StateTable<gsmTables::gsmServingCell>;
using GSMSet = ListTable<gsmTables::gsmSet>;
using HSDPAInformation = StateTable<gsmTables::hsdpaInformation>;
using MobileAllocation = StateTable<gsmTables::mobileAllocation>;
using MonitoredSet = ListTable<gsmTables::monitoredSet>;
using NonRankedGSMSet = ListTable<gsmTables::nonRankedGSMSet>;
using NonRankedUMTSSet = ListTable<gsmTables::nonRankedUMTSSet>;
using ProcessCO = StateTable<gsmTables::processCO>;
using ProcessCS = StateTable<gsmTables::processCS>;
using ProcessPS = StateTable<gsmTables::processPS>;
using UMTSRRMeasurement = StateTable<gsmTables::umtsRRMeasurement>;
using UMTSSet = ListTable<gsmTables::umtsSet>;
using VirtualActiveSet = ListTable<gsmTables::virtualActiveSet>;

}  // namespace kelvasi
