// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Subscription.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::record;

Subscription subscription(std::initializer_list<PlistDictionary::Entry> command) {
  return Subscription::fromStartCommand(PlistDictionary(command));
}

Message message(LogCode code) {
  return logMessage(record(code, ""));
}

TEST(Subscription, WantsTheCodesOfBothLists) {
  const auto wanted = subscription({{"SetOrvaneLogCodes", PlistArray::make({28976, 45248})},
                                    {"SetTelvonExtraCodes", PlistArray::make({1})}});
  EXPECT_TRUE(wanted.wants(message(0x7130)));
  EXPECT_TRUE(wanted.wants(message(0xB0C0)));
  EXPECT_TRUE(wanted.wants(message(0xFF0001)));
  EXPECT_FALSE(wanted.wants(message(0x7131)));
  EXPECT_FALSE(wanted.wants(message(0x0001)));
  EXPECT_FALSE(wanted.wants(message(0xFF0002)));
  EXPECT_EQ(wanted.size(), 3u);
}

TEST(Subscription, OneListAloneAsksForNothingOfTheOther) {
  const auto wanted = subscription({{"SetOrvaneLogCodes", PlistArray::make({4234})}});
  EXPECT_TRUE(wanted.wants(message(4234)));
  EXPECT_FALSE(wanted.wants(message(0xFF0001)));
}

TEST(Subscription, ACommandWithoutListsAsksForEverything) {
  const auto wanted = subscription({{"SetState", "Streaming"}});
  EXPECT_TRUE(wanted.isForEverything());
  EXPECT_TRUE(wanted.wants(message(0x7130)));
}

TEST(Subscription, EmptyListsAskForNothing) {
  EXPECT_FALSE(subscription({{"SetOrvaneLogCodes", PlistArray::make()}}).wants(message(0x7130)));
}

TEST(Subscription, LeavesOutWhatIsNoCode) {
  const auto wanted =
      subscription({{"SetOrvaneLogCodes", PlistArray::make({-1, 65536, "28976", 1.5, true, 28976})}});
  EXPECT_EQ(wanted.size(), 1u);
  EXPECT_TRUE(wanted.wants(message(0x7130)));
}

TEST(Subscription, NeverHoldsBackWhatIsNoLogRecord) {
  const Message tooShort = logMessage(Bytes(12));
  EXPECT_EQ(tooShort.logCode, std::nullopt);
  EXPECT_TRUE(subscription({{"SetOrvaneLogCodes", PlistArray::make()}}).wants(tooShort));
}

}  // namespace
}  // namespace kelvasi::sim
