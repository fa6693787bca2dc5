// SPDX-License-Identifier: Apache-2.0
#include "Plist/Encoding.h"

#include <gtest/gtest.h>

#include <limits>

namespace kelvasi {
namespace {

TEST(Encoding, WritesDataInBase64) {
  EXPECT_EQ(base64({}), "");
  EXPECT_EQ(base64({0xFF}), "/w==");
  EXPECT_EQ(base64({1, 2}), "AQI=");
  EXPECT_EQ(base64({1, 2, 3}), "AQID");
}

TEST(Encoding, WritesDatesWithinTheCalendar) {
  EXPECT_EQ(iso8601(PlistDate{1'709'647'629.9}), "2024-03-05T14:07:09Z");
  EXPECT_EQ(iso8601(PlistDate{-1e300}), "0001-01-01T00:00:00Z");
  EXPECT_EQ(iso8601(PlistDate{std::numeric_limits<double>::quiet_NaN()}), "1970-01-01T00:00:00Z");
}

}  // namespace
}  // namespace kelvasi
