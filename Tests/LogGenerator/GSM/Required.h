// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/RequiredSections.h"

namespace kelvasi::test {

template <>
struct Required<Orvane_GSMClassIndex> {
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_GSM;
  static constexpr const char* displayTemplate = "Orvane_GSM";

  static inline const std::vector<RequiredSection> sections{
      {"Active Set", "ActiveSet", {0x417A}},
      {"Coding Scheme", "CellChangeCounters", {}, true},
      {"GPRS Information", "GPRSInformation", {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137}},
      {"GSM Serving Cell", "GSMServingCell", {0x5134, 0x5137, 0x5076, 0xFF0001}},
      {"Mobile Allocation", "MobileAllocation", {0x51F8}},
      {"Neighboring Cells", "NeighboringCells", {0x5137, 0x51FF, 0xFF0001}},
      {"PDP Context Info", "PDPContextList", {0xFF0002}},
      {"Process PS", "ProcessPS", {0x7130, 0x7132}},
      {"UMTS RR Measurement", "UMTSRRMeasurement", {}, true},
      {"Cell Change Counters", "CellChangeCounters", {}, true},
      {"Detected Set", "DetectedSet", {0x417A}},
      {"GSM Set", "GSMSet", {0x4005}},
      {"Non-Ranked GSM Set", "NonRankedGSMSet", {}, true},
      {"Process CO", "ProcessCS", {0x7131, 0x7132}},
      {"Serving PLMN", "Serving PLMN", {0x7135, 0x7132, 0xFF0001}},
      {"UMTS Set", "UMTSSet", {0x4005, 0xFF0001}},
      {"Equivalent PLMN List", "Equivalent PLMN List", {0x7150}},
      {"GSM RR Info", "GSMRRInfo", {0x512C, 0x5137, 0x5072, 0x51F6}},
      {"Monitored Set", "MonitoredSet", {0x417A}},
      {"Non-Ranked UMTS Set", "NonRankedUMTSSet", {}, true},
      {"Process CS", "ProcessCS", {0x7131, 0x7132}},
      {"UMTS RR Info", "UMTSRRInfo", {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001}},
      {"BLER", "BLER", {0x4116}},
      {"Virtual Active Set", "VirtualActiveSet", {0x417A}},
      {"SIM Info", "SimInfo", {0xFF0000}, true},
      {"HSDPA Info", "HSDPA Info", {0x4221}, true},
  };

  static inline const std::vector<RequiredLength> lengths{
      {0x4005, 15}, {0x4031, 16}, {0x4116, 16}, {0x4125, 14}, {0x4127, 29}, {0x4157, 19}, {0x417A, 16},
      {0x4221, 18}, {0x5072, 20}, {0x5076, 17}, {0x512C, 17}, {0x5134, 26}, {0x5137, 29}, {0x51F4, 15},
      {0x51F5, 18}, {0x51F6, 24}, {0x51F8, 15}, {0x51FB, 34}, {0x51FD, 35}, {0x51FF, 15}, {0x7130, 16},
      {0x7131, 16}, {0x7132, 16}, {0x7135, 32}, {0x7150, 17}};

  // Kept for the next measurements.
  static inline const std::vector<LogCode> showNothing{0x51FF};
};

}  // namespace kelvasi::test
