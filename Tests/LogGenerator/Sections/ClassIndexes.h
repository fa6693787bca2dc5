// SPDX-License-Identifier: Apache-2.0
// The class indexes of all technologies, for tests of every decoder in them.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "Tests/LogGenerator/GSM/Required.h"
#include "Tests/LogGenerator/LTE/Required.h"
#include "Tests/LogGenerator/UTRAN/Required.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi::test {

using ClassIndexes = testing::Types<Orvane_GSMClassIndex, LTEClassIndex, UTRANClassIndex>;

struct IndexName {
  template <typename Index>
  static std::string GetName(int) {
    return Required<Index>::displayTemplate;
  }
};

// In the order in which they are first asked for.
inline std::vector<LogCode> logCodesOf(const ClassIndex& index) {
  std::vector<LogCode> codes;
  for (const std::string& key : index.getAllLogCodes())
    codes.push_back(static_cast<LogCode>(std::stoul(key)));
  return codes;
}

// Those of the baseband: the others carry property lists.
inline std::vector<LogCode> recordCodesOf(const ClassIndex& index) {
  std::vector<LogCode> codes = logCodesOf(index);
  std::erase_if(codes, [](LogCode code) { return code >= extraLogCodes; });
  return codes;
}

template <typename Index>
bool showsRows(LogCode logCode) {
  return std::ranges::count(Required<Index>::showNothing, logCode) == 0;
}

}  // namespace kelvasi::test
