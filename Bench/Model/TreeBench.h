// SPDX-License-Identifier: Apache-2.0
// The display tree and the tick that builds it.
#pragma once

#include "Bench/LogGenerator/Samples.h"
#include "Bench/Support/Table.h"

namespace kelvasi::bench {

struct FilledDisplay {
  Technology technology;
  Messages messages;  // those of an interval, which fill it
  std::size_t nodes;
};

// Of the technology that shows the most.
FilledDisplay largestDisplay();

// Of the technology that shows the most.
void addTree(Table& table);

}  // namespace kelvasi::bench
