// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingChanges.h"

#include <gtest/gtest.h>

#include "LogGenerator/Row.h"

namespace kelvasi {
namespace {

constexpr Row level{.key = "Level", .quantity = quantity::rssi};
constexpr Row code{.key = "Code", .quantity = quantity::pci};
constexpr Row emptyGroup{.key = "", .quantity = quantity::group, .special = ValueText{0, "{}"}};
const ReadingSection cell{.name = "Cell", .path = "/Cell"};
const ReadingSection list{.name = "List", .path = "/List"};

Reading row(std::int64_t raw) {
  return {.section = &cell, .row = &level, .raw = raw, .key = level.key};
}
Reading inList(std::int32_t entry, const Row& of, std::int64_t raw) {
  return {.entry = entry, .section = &list, .row = &of, .raw = raw, .key = of.key};
}
Reading removal(std::int32_t entry) {
  return {.kind = Reading::Kind::removal, .entry = entry, .section = &list};
}

// The changes of one message after the other, a line each: path=text.
class Changes {
 public:
  std::string of(const std::vector<Reading>& message) {
    std::vector<ReadingText> texts;
    for (const Reading& reading : message) texts.push_back({&reading, pathOf(reading), textOf(reading)});
    std::string lines;
    for (const ReadingText& each : changes_.of(std::move(texts)))
      lines += each.path + "=" + each.text.value_or("-") + " ";
    return lines;
  }

 private:
  ReadingChanges changes_;
};

TEST(ReadingChanges, LeaveOutARowThatIsWrittenAgain) {
  Changes changes;
  EXPECT_EQ(changes.of({row(-90)}), "/Cell/Level=-90 ");
  EXPECT_EQ(changes.of({row(-90)}), "");
  EXPECT_EQ(changes.of({row(-91)}), "/Cell/Level=-91 ");
}

TEST(ReadingChanges, TellOfARowThatGoesAndComesBack) {
  Changes changes;
  const Reading gone{.kind = Reading::Kind::removal, .section = &cell, .key = level.key};
  EXPECT_EQ(changes.of({row(-90)}), "/Cell/Level=-90 ");
  EXPECT_EQ(changes.of({gone}), "/Cell/Level=- ");
  EXPECT_EQ(changes.of({gone}), "");
  EXPECT_EQ(changes.of({row(-90)}), "/Cell/Level=-90 ");
}

TEST(ReadingChanges, OfAListWithTheSameRowsAreTheRowsThatDiffer) {
  Changes changes;
  EXPECT_EQ(changes.of({inList(0, code, 7), inList(0, level, -90)}), "/List/0/Code=7 /List/0/Level=-90 ");
  EXPECT_EQ(changes.of({removal(0), inList(0, code, 7), inList(0, level, -91)}), "/List/0/Level=-91 ");
}

TEST(ReadingChanges, OfAListWithOtherRowsAreAllOfIt) {
  Changes changes;
  changes.of({inList(0, code, 7)});
  EXPECT_EQ(changes.of({removal(0), inList(0, code, 7), inList(1, code, 8)}),
            "/List/0=- /List/0/Code=7 /List/1/Code=8 ");
  EXPECT_EQ(changes.of({removal(1), removal(0)}), "/List/1=- /List/0=- ");
  EXPECT_EQ(changes.of({inList(0, code, 7)}), "/List/0/Code=7 ");
}

TEST(ReadingChanges, OfARowAndAListInTurnAtOnePlaceAreEachOfThem) {
  Changes changes;
  const Reading none{.section = &cell, .row = &level, .raw = 1, .key = "Pilots"};
  const std::vector<Reading> pilots{
      {.keyKind = Reading::Key::element, .section = &cell, .row = &emptyGroup, .list = "Pilots"},
      {.keyKind = Reading::Key::element,
       .section = &cell,
       .row = &level,
       .raw = -5,
       .list = "Pilots",
       .key = "0;9"}};
  EXPECT_EQ(changes.of(pilots), "/Cell/Pilots={} /Cell/Pilots/0;9=-5 ");
  EXPECT_EQ(changes.of({none}), "/Cell/Pilots=1 ");
  EXPECT_EQ(changes.of(pilots), "/Cell/Pilots={} /Cell/Pilots/0;9=-5 ");
  EXPECT_EQ(changes.of({none}), "/Cell/Pilots=1 ");
}

TEST(ReadingChanges, OfAWholeDisplayWithTheSameRowsAreTheRowsThatDiffer) {
  Changes changes;
  const Reading everything{.kind = Reading::Kind::removal};
  EXPECT_EQ(changes.of({everything, row(-90)}), "=- /Cell/Level=-90 ");
  EXPECT_EQ(changes.of({everything, row(-90)}), "");
  EXPECT_EQ(changes.of({everything, row(-91)}), "/Cell/Level=-91 ");
  EXPECT_EQ(changes.of({everything}), "=- ");
}

}  // namespace
}  // namespace kelvasi
