// SPDX-License-Identifier: Apache-2.0
// What holds for every record of the generator's list, whatever it shows.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>

#include "LogGenerator/C2K/C2KUpdate.h"
#include "Tests/LogGenerator/C2K/C2KFixture.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi {
namespace {

using test::record;

constexpr std::size_t longest = 5000;
constexpr std::array<std::uint8_t, 3> fills{0x00, 0x02, 0xFF};

// In a buffer of exactly this size, so that a read past its end is seen. Every payload byte is `fill`.
Bytes filled(LogCode logCode, std::size_t length, std::uint8_t fill) {
  Bytes bytes = record(logCode, "");
  bytes.resize(length, fill);
  bytes.shrink_to_fit();
  return bytes;
}

// Every lookup name has a leaf.
struct AllRows : test::C2KFixture {
  AllRows() : C2KFixture(test::c2kLookupNames()) {
    generator.generateLogUsingState(state);
    surroundings.log.isMasked = true;
  }

  Outcome outcomeOf(const C2KRecord& each, const Bytes& bytes) {
    const PlistValue lookup = state.get("Lookup");
    return each.parse({RecordView(bytes), state, *lookup.dictionary(), surroundings.log, sections, pilots});
  }
  // The least length at which the parser does not find the record too short.
  std::size_t minimumLength(const C2KRecord& each) {
    std::size_t length = RecordView::headerSize;
    while (length < longest && outcomeOf(each, filled(each.logCode, length, 0)) == Outcome::tooShort)
      ++length;
    return length;
  }

  C2KSections sections;
  PilotList pilots;
};

TEST(EveryC2KRecord, HasACodeOfItsOwn) {
  for (const C2KRecord& each : c2kRecords())
    EXPECT_EQ(std::ranges::count(c2kRecords(), each.logCode, &C2KRecord::logCode), 1) << each.logCode;
}

TEST(EveryC2KRecord, OneShorterThanItsMinimumIsReportedAndChangesNothing) {
  for (const C2KRecord& each : c2kRecords()) {
    AllRows fixture;
    const std::size_t minimum = fixture.minimumLength(each);
    ASSERT_LT(minimum, longest) << each.logCode;
    AllRows other;
    other.surroundings.log.isMasked = false;
    const std::string before = other.display();
    other.surroundings.log.clear();
    for (std::size_t length = RecordView::headerSize; length < minimum; ++length)
      other.take(filled(each.logCode, length, 0xFF));
    EXPECT_EQ(other.display(), before) << each.logCode;
    EXPECT_EQ(other.errors().size(), minimum - RecordView::headerSize) << each.logCode;
  }
}

TEST(EveryC2KRecord, AnyBytesLeaveTextsAndDictionariesOnly) {
  std::mt19937 random(11);
  for (const C2KRecord& each : c2kRecords()) {
    AllRows fixture;
    const std::size_t minimum = fixture.minimumLength(each);
    for (int turn = 0; turn < 500; ++turn) {
      Bytes bytes = filled(each.logCode, minimum + random() % 64, 0);
      for (std::size_t at = 13; at < bytes.size(); ++at) bytes[at] = static_cast<std::uint8_t>(random());
      fixture.take(bytes);
    }
    for (const auto& [name, value] : *fixture.state.find("Display")->dictionary())
      EXPECT_TRUE(value.string() || value.dictionary()) << name;
  }
}

struct DeafLog : SystemLog {
  bool wants(LogPriority priority) const override { return priority == LogPriority::error; }
  void write(LogPriority, std::string_view) override {}
};

// All bytes the same, of the least length and of a longer one.
TEST(EveryC2KRecord, RecordsInTurnCostNoAllocation) {
  DeafLog log;
  for (const C2KRecord& each : c2kRecords()) {
    AllRows fixture;
    std::vector<Bytes> records;
    for (const std::size_t more : {0U, 28U}) {
      for (const std::uint8_t fill : fills)
        records.push_back(filled(each.logCode, fixture.minimumLength(each) + more, fill));
    }
    const PlistValue lookup = fixture.state.get("Lookup");
    const auto takeInTurn = [&] {
      for (const Bytes& bytes : records)
        each.parse(
            {RecordView(bytes), fixture.state, *lookup.dictionary(), log, fixture.sections, fixture.pilots});
    };
    for (int round = 0; round < 3; ++round) takeInTurn();
    EXPECT_EQ(test::allocationsDuring(takeInTurn), 0u) << std::hex << each.logCode;
  }
}

}  // namespace
}  // namespace kelvasi
