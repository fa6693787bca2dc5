// SPDX-License-Identifier: Apache-2.0
// The tables of the decoders in Lua, for the dissector of Wireshark.
#pragma once

#include <span>
#include <string>

#include "Tools/Kelvasictl/FieldList.h"

namespace kelvasi {

// Defines `tables`: quantities, texts, layouts, lists, records by their log code, cells and SIM files of the
// daemon's own records, names of the object stream, and what decoders calculate with.
std::string dissectorTables(std::span<const TechnologyFields> technologies);

}  // namespace kelvasi
