// SPDX-License-Identifier: Apache-2.0
#include "Simulator/MessageFaults.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::hex;
using kelvasi::test::record;

Message message(LogCode code = 0x7130) {
  return logMessage(record(code, "AA BB CC"));
}

Messages damaged(std::initializer_list<std::string_view> requests, std::size_t count) {
  Faults faults;
  for (const auto request : requests) EXPECT_EQ(faults.add(request), "");
  Messages messages(count, message());
  MessageFaults(faults).apply(messages);
  return messages;
}

TEST(MessageFaults, ChangeNothingUnlessRequested) {
  const Messages messages = damaged({}, 20);
  ASSERT_EQ(messages.size(), 20u);
  for (const Message& each : messages) EXPECT_EQ(each.bytes, message().bytes);
}

TEST(MessageFaults, PrefixEveryNthMessage) {
  const Messages messages = damaged({"prefix=2"}, 4);
  ASSERT_EQ(messages.size(), 4u);
  EXPECT_EQ(messages[0].bytes, message().bytes);
  EXPECT_EQ(messages[1].bytes, hex("81 00 01 00 00 30 71 00 00 00 00 00 00 00 00 AA BB CC"));
  EXPECT_EQ(messages[2].bytes, message().bytes);
  EXPECT_EQ(messages[3].bytes.front(), 0x81);
}

TEST(MessageFaults, ACopyWithAnInvalidLogTypeFollowsEveryNthMessage) {
  const Messages messages = damaged({"invalid-type=3"}, 6);
  ASSERT_EQ(messages.size(), 8u);
  EXPECT_EQ(messages[2].bytes, message().bytes);
  EXPECT_EQ(messages[3].bytes, hex("02 00 00 30 71 00 00 00 00 00 00 00 00 AA BB CC"));
  EXPECT_EQ(messages[7].bytes.front(), 0x7F);
  for (const Message& each : messages) EXPECT_EQ(each.id, 0u);
}

TEST(MessageFaults, ADamagedCopyUnderAnotherIdFollowsEveryNthMessage) {
  const Messages messages = damaged({"other-id=1"}, 2);
  ASSERT_EQ(messages.size(), 4u);
  EXPECT_EQ(messages[0].id, 0u);
  EXPECT_NE(messages[1].id, 0u);
  EXPECT_NE(messages[1].bytes, message().bytes);
  EXPECT_EQ(messages[1].logCode, LogCode{0x7130});
  EXPECT_NE(messages[3].id, messages[1].id);
}

TEST(MessageFaults, ShortRunsThroughAllLengthsButSparesPropertyLists) {
  const Messages messages = damaged({"short=1"}, 16);
  std::vector<std::size_t> lengths;
  for (const Message& each : messages) lengths.push_back(each.bytes.size());
  EXPECT_THAT(lengths, testing::ElementsAre(1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 0));

  Faults faults;
  faults.add("short=1");
  Messages list{message(0xFF0001)};
  MessageFaults(faults).apply(list);
  EXPECT_EQ(list[0].bytes.size(), 16u);
}

TEST(MessageFaults, CountOnFromBatchToBatch) {
  Faults faults;
  faults.add("prefix=2");
  MessageFaults applied(faults);
  Messages first{message()};
  Messages second{message()};
  applied.apply(first);
  applied.apply(second);
  EXPECT_EQ(first[0].bytes.front(), 0x01);
  EXPECT_EQ(second[0].bytes.front(), 0x81);
}

}  // namespace
}  // namespace kelvasi::sim
