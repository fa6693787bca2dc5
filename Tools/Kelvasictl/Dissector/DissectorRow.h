// SPDX-License-Identifier: Apache-2.0
// A row as the dissector reads it: what it shows of a raw value, and which number that is.
#pragma once

#include <string_view>

#include "LogGenerator/Row.h"
#include "Tools/Kelvasictl/Dissector/SharedTables.h"

namespace kelvasi {

// `key` is the row's in the display. The place in the layout counts from 1; none where there is no layout.
LuaTable dissectorRow(std::string_view key, const Row& row, bool hasField, SharedTables& shared);

}  // namespace kelvasi
