// SPDX-License-Identifier: Apache-2.0
// The viewer without a display: its start, and a tick from the state to painted rows.
#pragma once

#include "Bench/Support/Table.h"

namespace kelvasi::bench {

void addViewer(Table& table, bool isSmoke);

}  // namespace kelvasi::bench
