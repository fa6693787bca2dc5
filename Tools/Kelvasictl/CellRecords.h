// SPDX-License-Identifier: Apache-2.0
// The cells of a drive as records.
#pragma once

#include <vector>

#include "Radio/Operators.h"
#include "Survey/Cells/Cells.h"
#include "Tools/Kelvasictl/RecordOutput.h"

namespace kelvasi {

// In the order in which they were first heard of; what NDJSON prints for each.
std::vector<Json> cellRecords(const survey::Cells& cells, const Operators& operators);

// Tables and CSV have a line for each level of a cell; in a table only the first tells of the cell, with the
// most important of its roles, and only the levels that say how well it is received are shown.
void printCells(const survey::Cells& cells, const Operators& operators, RecordOutput::Format format,
                RecordOutput::Print print);

}  // namespace kelvasi
