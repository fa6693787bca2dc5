// The display tree and the tick that builds it.
#pragma once

#include "Bench/Support/Table.h"

namespace kelvasi::bench {

// Of the technology that shows the most.
void addTree(Table& table);

}  // namespace kelvasi::bench
