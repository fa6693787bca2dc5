// SPDX-License-Identifier: Apache-2.0
// The same work as the benchmarks', for valgrind's callgrind to count its instructions.
#pragma once

namespace kelvasi::bench {

// Has each measurement counted on its own: `--collect-atstart=no` keeps the preparation out. Callgrind writes
// a profile for each, named by its trigger as "NAME (ITEMS)".
void countInstructions();

}  // namespace kelvasi::bench
