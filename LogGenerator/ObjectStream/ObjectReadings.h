// SPDX-License-Identifier: Apache-2.0
// What the names and units of the object stream mean. There texts are the wire, so numbers are read from
// them, by this one table.
#pragma once

#include <span>

#include "LogGenerator/Readings.h"
#include "LogGenerator/Row.h"

namespace kelvasi {

// A text under one of these keys that is a number and the row's unit is of the row's quantity.
std::span<const Row> objectRows();

// What the cells of the section of this name are to the handset.
CellRole roleOfObjectSection(std::string_view name);

// Gives the values of a display their quantities, numbers and cells, as far as their names tell.
void nameObjectReadings(std::span<Reading> readings);

}  // namespace kelvasi
