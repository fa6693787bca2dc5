// SPDX-License-Identifier: Apache-2.0
#include "Survey/Events/EventLog.h"

#include <gtest/gtest.h>

namespace kelvasi::survey {
namespace {

Event numbered(int number) {
  Event event;
  event.to = std::to_string(number);
  return event;
}

TEST(EventLog, KeepsTheNewestAndCountsTheRest) {
  EventLog log(3);
  for (int number = 0; number < 5; ++number) log.add(numbered(number));
  ASSERT_EQ(log.size(), 3U);
  EXPECT_EQ(log.at(0).to, "2");
  EXPECT_EQ(log.at(2).to, "4");
  EXPECT_EQ(log.dropped(), 2U);
}

TEST(EventLog, MayKeepNone) {
  EventLog log(0);
  log.add(numbered(1));
  EXPECT_EQ(log.size(), 0U);
  EXPECT_EQ(log.dropped(), 1U);
}

TEST(EventLog, AnEmptyLogIsEmpty) {
  EXPECT_EQ(EventLog().size(), 0U);
}

}  // namespace
}  // namespace kelvasi::survey
