// SPDX-License-Identifier: Apache-2.0
// The log channel between two processes.
#pragma once

#include "Bench/Support/Table.h"

namespace kelvasi::bench {

void addChannel(Table& table, bool isSmoke);

}  // namespace kelvasi::bench
