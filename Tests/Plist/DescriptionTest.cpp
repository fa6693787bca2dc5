// SPDX-License-Identifier: Apache-2.0
#include "Plist/Description.h"

#include <gtest/gtest.h>

#include <cmath>

namespace kelvasi {
namespace {

TEST(Description, OfADateIsUtcWithItsOffset) {
  EXPECT_EQ(description(PlistDate{1709647629.75}), "2024-03-05 14:07:09 +0000");
  EXPECT_EQ(description(PlistDate{0}), "1970-01-01 00:00:00 +0000");
  EXPECT_EQ(description(PlistDate{-1}), "1969-12-31 23:59:59 +0000");
}

TEST(Description, OfADateNoCalendarReachesIsTheCalendarsEnd) {
  EXPECT_EQ(description(PlistDate{1e300}), "32767-12-31 00:00:00 +0000");
  EXPECT_EQ(description(PlistDate{-1e300}), "-32767-01-01 00:00:00 +0000");
  EXPECT_EQ(description(PlistDate{std::nan("")}), "-32767-01-01 00:00:00 +0000");
}

TEST(Description, OfScalars) {
  EXPECT_EQ(description(PlistValue("as it stands; even so")), "as it stands; even so");
  EXPECT_EQ(description(PlistValue(-5)), "-5");
  EXPECT_EQ(description(PlistValue(~std::uint64_t{0})), "18446744073709551615");
  EXPECT_EQ(description(PlistValue(0.25)), "0.25");
  EXPECT_EQ(description(PlistValue(true)), "1");
  EXPECT_EQ(description(PlistValue(Bytes{1, 2, 3, 4, 0xff})), "<01020304 ff>");
  EXPECT_EQ(description(PlistValue()), "(null)");
}

TEST(Description, OfContainersIsIndentedAndQuotesWhatNeedsIt) {
  const PlistValue value = PlistDictionary::make({{"State", "Cell DCH"},
                                                  {"List", PlistArray::make({"a", "b\"c", ""})},
                                                  {"Empty", PlistDictionary::make()}});
  EXPECT_EQ(description(value),
            "{\n"
            "    State = \"Cell DCH\";\n"
            "    List = (\n"
            "        a,\n"
            "        \"b\\\"c\",\n"
            "        \"\"\n"
            "    );\n"
            "    Empty = {\n"
            "    };\n"
            "}");
}

}  // namespace
}  // namespace kelvasi
