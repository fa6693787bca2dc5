// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/RequiredSections.h"

namespace kelvasi::test {

template <>
struct Required<LTEClassIndex> {
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_LTE;
  static constexpr const char* displayTemplate = "LTE";

  static inline const std::vector<RequiredSection> sections{
      {"Serving Cell Info", "LTE Serving Cell Info", {0xB0C2, 0xB0C1, 0xFF0001}},
      {"Connected mode LTE Intra-frequency Measurement",
       "Connected mode LTE Intra-frequency Measurement",
       {0xB179}},
      {"Measured Neighbor Cells", "Measured Neighbor Cells", {0xB179}},
      {"Detected Cells", "Detected Cells", {0xB179}},
      {"Serving Cell Measurements", "Serving Cell Measurements", {0xB17F}},
      {"Neighbor Measurements", "Neighbor Measurements", {0xB180}},
      {"Neighbor Cells List", "Neighbor Cells List", {0xB180}},
      {"Reselection Candidates", "Reselection Candidates", {0xB186}},
      {"Reselection Candidates List", "Reselection Candidates List", {0xB186}},
      {"SIM Info", "SimInfo", {0xFF0000}, true},
      {"PDP Context Info", "PDPContextList", {0xFF0002}},
  };

  static inline const std::vector<RequiredLength> lengths{{0xB0C1, 22}, {0xB0C2, 38}, {0xB179, 29},
                                                          {0xB17F, 33}, {0xB180, 21}, {0xB186, 21}};

  static inline const std::vector<LogCode> showNothing{};
};

}  // namespace kelvasi::test
