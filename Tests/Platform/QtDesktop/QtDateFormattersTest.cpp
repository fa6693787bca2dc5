// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/QtDateFormatters.h"

#include <gtest/gtest.h>

#include <QByteArray>
#include <ctime>

namespace kelvasi {
namespace {

constexpr PlistDate moment{1709647629};  // 2024-03-05 14:07:09 UTC

std::string textOf(PlistDate date, const char* zone) {
  qputenv("TZ", zone);
  ::tzset();
  return QtDateFormatters().makeDateFormatter("'Updated' yyyy-MM-dd 'at' HH:mm:ss")->stringFromDate(date);
}

TEST(QtDateFormatters, FollowThePatternWithLiteralsInQuotes) {
  EXPECT_EQ(textOf(moment, "UTC"), "Updated 2024-03-05 at 14:07:09");
}

TEST(QtDateFormatters, UseTheDevicesTimeZone) {
  EXPECT_EQ(textOf(moment, "XST-05:30"), "Updated 2024-03-05 at 19:37:09");
}

TEST(QtDateFormatters, CutFractionsOfASecondDownwards) {
  EXPECT_EQ(textOf({moment.secondsSince1970 + 0.999}, "UTC"), "Updated 2024-03-05 at 14:07:09");
  EXPECT_EQ(textOf({-0.5}, "UTC"), "Updated 1969-12-31 at 23:59:59");
}

}  // namespace
}  // namespace kelvasi
