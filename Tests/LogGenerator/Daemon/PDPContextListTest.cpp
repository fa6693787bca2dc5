// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Daemon/PDPContextList.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using Section = test::SectionFixture<PDPContextList>;

TEST(PDPContextList, ShowsTheContextsAsTheyStand) {
  auto section = Section::list();
  const PlistValue contexts =
      PlistArray::make({PlistDictionary::make({{"APN", "internet"}, {"Address", "10.0.0.1"}}), "text"});
  section.takeList(0xFF0002, contexts);
  EXPECT_EQ(section.section, contexts);
}

TEST(PDPContextList, WritesItsTraceAtEveryUpdate) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.takeList(0xFF0002, PlistArray::make());
  section.take(test::textRecord(0xFF0002, "nothing that parses"));
  EXPECT_THAT(section.surroundings.log.warnings(), testing::ElementsAre("PDPContextList", "PDPContextList"));
}

TEST(PDPContextList, AnEmptyArrayEmptiesTheList) {
  auto section = Section::list();
  section.takeList(0xFF0002, PlistArray::make({"one"}));
  section.takeList(0xFF0002, PlistArray::make());
  EXPECT_EQ(section.text(), "");
}

TEST(PDPContextList, WhatIsNoArrayLeavesTheListAsItWas) {
  auto section = Section::list();
  section.takeList(0xFF0002, PlistArray::make({"one"}));
  section.takeList(0xFF0002, PlistDictionary::make({{"APN", "internet"}}));
  section.take(test::textRecord(0xFF0002, "nothing that parses"));
  EXPECT_EQ(section.text(), "[one]");
  EXPECT_THAT(section.surroundings.log.errors(), testing::IsEmpty());
}

TEST(PDPContextList, LogsACodeThatItDidNotAskFor) {
  auto section = Section::list();
  section.take(test::record(0xFF0001, ""));
  EXPECT_THAT(section.surroundings.log.errors(),
              testing::ElementsAre("Received an unknown log message: 16711681"));
}

}  // namespace
}  // namespace kelvasi
