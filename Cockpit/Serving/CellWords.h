// SPDX-License-Identifier: Apache-2.0
// What cells are called.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Radio/CellIdentity.h"

namespace kelvasi::cockpit {

// "LTE", "UMTS", "UTRA TDD", "GSM", "1x", "EV-DO"; empty for none.
std::string_view technologyWord(RadioFamily family);
// "E-ARFCN", "UARFCN", "ARFCN", "Channel".
std::string_view channelWord(RadioFamily family);
// "PCI", "PSC", "CPI" (cell parameter identity), "BSIC", "PN".
std::string_view codeWord(RadioFamily family);

// "PCI 404"; by its channel where the code is not known: "ARFCN 84". Empty for no cell.
std::string cellName(const CellIdentity& cell);
// "LTE 3350/404"
std::string fullCellName(const CellIdentity& cell);
// The identity that textOf() writes so; nothing for any other text.
std::optional<CellIdentity> cellFromText(std::string_view text);

struct CarrierWords {
  std::string bands;      // "B7", "DCS 1800 or PCS 1900"; empty where none or too many are possible
  std::string frequency;  // "2680 MHz", of the downlink
};
CarrierWords carrierWords(const CellIdentity& cell, std::optional<std::int64_t> bandClass = {});

}  // namespace kelvasi::cockpit
