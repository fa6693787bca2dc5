// SPDX-License-Identifier: Apache-2.0
// Counts what a test allocates. AllocationCounter.cpp replaces the global operator new of the program that it
// is compiled into, so it belongs into the sources of that one test program.
#pragma once

#include <cstddef>

namespace kelvasi::test {

std::size_t allocationsSoFar();

// How often operator new is called while `work` runs.
template <typename Work>
std::size_t allocationsDuring(Work work) {
  const std::size_t before = allocationsSoFar();
  work();
  return allocationsSoFar() - before;
}

}  // namespace kelvasi::test
