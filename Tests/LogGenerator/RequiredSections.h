// SPDX-License-Identifier: Apache-2.0
// What the class index of a technology is required to hold, in this order. Decoders beyond these may stand
// anywhere between them: the tests of every section find them by themselves.
#pragma once

#include <algorithm>
#include <string_view>
#include <vector>

#include "LogGenerator/LogCode.h"

namespace kelvasi::test {

struct RequiredSection {
  std::string_view name;
  std::string_view trace;  // written to the system log at every record
  std::vector<LogCode> logCodes;
  bool isSilent = false;  // says nothing about a code that it did not ask for
};

struct RequiredLength {
  LogCode logCode = 0;
  std::size_t minimum = 0;  // of a record that is taken
};

// To be specialised for each class index: its technology, its template's name, its sections and the least
// lengths of its records, and the codes whose records show nothing by themselves.
template <typename Index>
struct Required;

// What the required sections ask for, each code once.
template <typename Index>
std::vector<LogCode> requiredCodes() {
  std::vector<LogCode> codes;
  for (const RequiredSection& section : Required<Index>::sections) {
    for (const LogCode code : section.logCodes) {
      if (std::ranges::count(codes, code) == 0) codes.push_back(code);
    }
  }
  return codes;
}

}  // namespace kelvasi::test
