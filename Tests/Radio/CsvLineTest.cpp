// SPDX-License-Identifier: Apache-2.0
#include "Radio/CsvLine.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::Optional;

TEST(CsvLine, FieldsAreDividedByCommas) {
  EXPECT_THAT(csvFields("262,01,Telekom"), Optional(ElementsAre("262", "01", "Telekom")));
  EXPECT_THAT(csvFields(""), Optional(ElementsAre("")));
  EXPECT_THAT(csvFields("a,"), Optional(ElementsAre("a", "")));
  EXPECT_THAT(csvFields(",,b"), Optional(ElementsAre("", "", "b")));
  EXPECT_THAT(csvFields(" a , b"), Optional(ElementsAre(" a ", " b")));
}

TEST(CsvLine, AQuotedFieldMayHoldCommasAndQuotes) {
  EXPECT_THAT(csvFields(R"(1,"One, Two","say ""no""",)"),
              Optional(ElementsAre("1", "One, Two", R"(say "no")", "")));
  EXPECT_THAT(csvFields(R"("")"), Optional(ElementsAre("")));
  EXPECT_THAT(csvFields(R"(a"b)"), Optional(ElementsAre(R"(a"b)")));
}

TEST(CsvLine, AQuoteThatIsNotClosedOrFollowedByMoreIsAFault) {
  EXPECT_EQ(csvFields(R"(1,"One)"), std::nullopt);
  EXPECT_EQ(csvFields(R"(1,"One"")"), std::nullopt);
  EXPECT_EQ(csvFields(R"(1,"One"x,2)"), std::nullopt);
  EXPECT_EQ(csvFields(R"(")"), std::nullopt);
}

}  // namespace
}  // namespace kelvasi
