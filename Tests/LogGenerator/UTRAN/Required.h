// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/RequiredSections.h"

namespace kelvasi::test {

template <>
struct Required<UTRANClassIndex> {
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_UTRAN2;
  static constexpr const char* displayTemplate = "UTRAN";

  static inline const std::vector<RequiredSection> sections{
      {"RRC Info", "RRC Info", {0xD0E0}, true},
      {"Serving Cell Info", "Serving Cell Info", {0xD0E2, 0xFF0001}, true},
      {"Neighbor Cell List", "NeighbhorMeasurements List", {0xD00A}, true},
      {"GSM Neighbor Cell List", "GSM Neighbor Cell List", {0xD00E}, true},
      {"TRCH BLER", "TRCH BLER Measurement", {0xD00C}, true},
      {"CCTRCH SIR", "CCTRCH SIR Measurement", {0xD00C}, true},
      {"PDP Context Info", "PDPContextList", {0xFF0002}},
      {"SIM Info", "SimInfo", {0xFF0000}, true},
  };

  // A record of the state is read on with what it lacks as zero.
  static inline const std::vector<RequiredLength> lengths{
      {0xD0E0, 0}, {0xD0E2, 26}, {0xD00A, 21}, {0xD00C, 17}, {0xD00E, 17}};

  // Its section stays empty.
  static inline const std::vector<LogCode> showNothing{0xD00E};
};

}  // namespace kelvasi::test
