// SPDX-License-Identifier: Apache-2.0
#include "Model/MoreLogCodes.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

PlistValue numbers(std::initializer_list<std::int64_t> values) {
  const auto list = PlistArray::make();
  for (const std::int64_t value : values) list->append(value);
  return list;
}

PlistValue streaming(PlistValue baseband, PlistValue daemon) {
  const auto command = PlistDictionary::make({{"SetState", "Streaming"}});
  if (!baseband.isAbsent()) command->set("SetOrvaneLogCodes", std::move(baseband));
  if (!daemon.isAbsent()) command->set("SetTelvonExtraCodes", std::move(daemon));
  return command;
}

TEST(MoreLogCodes, AreAddedToTheListThatTheyBelongTo) {
  const std::vector<LogCode> more{0xB193, 0x1FEB, 0xFF0007};
  EXPECT_EQ(withLogCodes(streaming(numbers({45249}), numbers({1})), more),
            streaming(numbers({45249, 0x1FEB, 0xB193}), numbers({1, 7})));
}

TEST(MoreLogCodes, AreAskedForOnce) {
  const std::vector<LogCode> more{45249, 0xFF0001, 45249, 7};
  EXPECT_EQ(withLogCodes(streaming(numbers({45249}), numbers({1})), more),
            streaming(numbers({45249, 7}), numbers({1})));
}

TEST(MoreLogCodes, MakeAListThatWasNotThere) {
  const std::vector<LogCode> more{0xFF0001};
  EXPECT_EQ(withLogCodes(streaming(numbers({4234}), {}), more), streaming(numbers({4234}), numbers({1})));
}

TEST(MoreLogCodes, LeaveACommandForEverythingAsItIs) {
  const std::vector<LogCode> more{0xB193};
  EXPECT_EQ(withLogCodes(streaming({}, {}), more), streaming({}, {}));
}

TEST(MoreLogCodes, NoneLeaveTheCommandAsItIs) {
  EXPECT_EQ(withLogCodes(streaming(numbers({1, 2}), numbers({1})), {}),
            streaming(numbers({1, 2}), numbers({1})));
}

}  // namespace
}  // namespace kelvasi
