// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TreeText.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

TEST(TreeText, HasALineForEachNodeABranchAheadOfItsChildren) {
  const auto display =
      PlistDictionary::make({{"Cell", PlistDictionary::make({{"Channel", "12"}, {"State", ""}})},
                             {"List", PlistArray::make({"a", PlistDictionary::make()})},
                             {"Number", 7}});
  EXPECT_EQ(treeText(display),
            "/\t\n"
            "/Cell\t\n"
            "/Cell/Channel\t12\n"
            "/Cell/State\t\n"
            "/List\t\n"
            "/List/0\ta\n"
            "/List/1\t\n"
            "/Number\t(unknown)\n");
}

TEST(TreeText, ShowsSortedNamesWithoutTheirPrefixes) {
  EXPECT_EQ(treeText(PlistDictionary::make({{"_sorted", "x"}, {"02;B", "2"}, {"01;A", "1"}})),
            "/\t\n/A\t1\n/B\t2\n");
}

TEST(TreeText, IsOneLineWithoutADisplay) {
  EXPECT_EQ(treeText(PlistValue()), "/\t(unknown)\n");
}

TEST(TreeText, EscapesWhatWouldBreakALineOrSteerATerminal) {
  EXPECT_EQ(treeText(PlistDictionary::make({{"a\tb", "c\\d\ne\rf\x1b[2J\x7fg\xC3\xA9"}})),
            "/\t\n/a\\tb\tc\\\\d\\ne\\rf\\x1b[2J\\x7fg\xC3\xA9\n");
}

}  // namespace
}  // namespace kelvasi
