// SPDX-License-Identifier: Apache-2.0
// A set of WCDMA cells (3GPP TS 25.331, 8.4) whose section every cell-sets record empties and none fills.
#pragma once

#include <array>

#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

constexpr ListSection hollowSet(std::string_view name, std::string_view trace) {
  return {.name = name,
          .trace = trace,
          .logCodes = cellSets::logCodes,
          .logCode = cellSets::logCode,
          .minimumLength = cellSets::minimumLength,
          .list = cellSets::identities,
          .staysEmpty = true};
}

}  // namespace kelvasi
