// SPDX-License-Identifier: Apache-2.0
// Decoding, record type by record type and in drives.
#pragma once

#include "Bench/LogGenerator/Samples.h"
#include "Bench/Support/Baselines.h"

namespace kelvasi::bench {

// What each message alone makes a display show, for the comparison with a plain program.
std::vector<PlainRows> rowsOfEach(std::string_view technology, const Messages& messages);

void addRecordDecoding(Table& table);
void addDriveDecoding(Table& table);

}  // namespace kelvasi::bench
