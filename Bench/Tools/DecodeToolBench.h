// SPDX-License-Identifier: Apache-2.0
// What `kelvasictl decode` does: captures to displays, and its start.
#pragma once

#include "Bench/Support/Table.h"

namespace kelvasi::bench {

void addCaptureDecoding(Table& table, bool isSmoke);
void addToolStart(Table& table, bool isSmoke);

}  // namespace kelvasi::bench
