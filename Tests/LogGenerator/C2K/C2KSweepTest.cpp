// SPDX-License-Identifier: Apache-2.0
// Records of every length and with every count at its most, for the sanitizers to watch.
#include <gtest/gtest.h>

#include <array>
#include <random>

#include "Plist/Description.h"
#include "Tests/LogGenerator/C2K/C2KFixture.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/LogGenerator/C2K/Required.h"

namespace kelvasi {
namespace {

using test::C2KFixture;
using test::record;
using test::requiredC2KRecords;

constexpr std::array<std::uint8_t, 2> fills{0x00, 0xFF};

// Every lookup name has a leaf.
struct AllRows : C2KFixture {
  AllRows() : C2KFixture(test::c2kLookupNames()) { generator.generateLogUsingState(state); }
};

// In a buffer of exactly this size, so that a read past its end is seen. Every payload byte is `fill`.
Bytes filled(LogCode logCode, std::size_t length, std::uint8_t fill) {
  Bytes bytes = record(logCode, "");
  bytes.resize(length, fill);
  bytes.shrink_to_fit();
  return bytes;
}

// Of zeros but for bytes 13 and 14: a version of the system parameters, a sequence number of a rate.
Bytes zeros(const test::RequiredC2KRecord& each, std::size_t length, std::string_view digits) {
  return test::with(filled(each.logCode, length, 0), 13, digits);
}

// Every row, and everything that is remembered for the next record.
std::string everything(const C2KFixture& fixture) {
  const auto remembered = PlistDictionary::make({{"ExtraInfo", *fixture.state.find("ExtraInfo")}});
  for (const char* key : {"TrafficFER", "FLDataSeqNum", "FLDataSent", "RLDataSeqNum", "RLDataSent"})
    remembered->set(key, fixture.state.get(key));
  return fixture.display() + description(remembered);
}

TEST(C2KSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const auto& each : requiredC2KRecords) {
    AllRows fixture;
    for (const auto& other : requiredC2KRecords) fixture.take(zeros(other, other.minimumLength, "02 01"));
    fixture.state.set("TrafficFER", 0.25);
    const std::string before = everything(fixture);
    for (std::size_t length = 0; length < each.minimumLength; ++length) {
      for (const std::uint8_t fill : fills) fixture.take(filled(each.logCode, length, fill));
      ASSERT_EQ(everything(fixture), before) << each.logCode << " of " << length;
    }
    // Below a header there is no record to complain of.
    EXPECT_EQ(fixture.errors().size(), 2 * (each.minimumLength - RecordView::headerSize)) << each.logCode;
  }
}

// Two of them, for the rates.
TEST(C2KSweep, RecordsOfTheirMinimumAreTaken) {
  for (const auto& each : requiredC2KRecords) {
    for (std::size_t length = each.minimumLength; length <= each.minimumLength + 2; ++length) {
      AllRows fixture;
      fixture.take(zeros(each, length, "02 00"));
      fixture.take(zeros(each, length, "03 01"));
      const bool isRefused = each.isExact && length > each.minimumLength;
      EXPECT_EQ(fixture.errors().size(), isRefused ? 2u : 0u) << each.logCode << " of " << length;
      if (!each.row) continue;
      EXPECT_EQ(fixture.text(each.row), isRefused ? "" : each.text) << each.logCode << " of " << length;
    }
  }
}

// Counts of 255 over records that end inside the first entries, inside later ones, and behind the last.
TEST(C2KSweep, CountsOf255AreTakenWhereverTheRecordEnds) {
  for (const auto& each : requiredC2KRecords) {
    AllRows fixture;
    for (std::size_t length = 13; length <= 700; ++length) fixture.take(filled(each.logCode, length, 0xFF));
    for (const std::size_t length : {2500U, 3085U, 3593U, 5000U, 70000U})
      fixture.take(filled(each.logCode, length, 0xFF));
    EXPECT_FALSE(fixture.errors().empty()) << each.logCode;
  }
}

TEST(C2KSweep, ListsOf255AreShownWhole) {
  AllRows fixture;
  fixture.take(filled(0x12B6, 25 + 12 * 255, 0xFF));
  EXPECT_EQ(fixture.shown("kActiveSetPilots").dictionary()->size(), 256u);
  EXPECT_EQ(test::asText(fixture.shown("kActiveSetPilots").dictionary()->get("254;65535")), "+21.07 dB");
  Bytes fingers = filled(0x108A, 23 + 14 * 255, 0x02);
  fingers[22] = 255;
  fixture.take(fingers);
  EXPECT_EQ(fixture.shown("kFingerC2I").dictionary()->size(), 256u);
  EXPECT_EQ(test::asText(fixture.shown("kFingerC2I").dictionary()->get("254;514")), "+0.02 dB");
}

TEST(C2KSweep, RandomRecordsLeaveTextsAndDictionariesOnly) {
  AllRows fixture;
  fixture.surroundings.log.isMasked = true;
  std::mt19937 random(7);
  for (int turn = 0; turn < 4000; ++turn) {
    const test::RequiredC2KRecord& each = requiredC2KRecords[random() % requiredC2KRecords.size()];
    Bytes bytes = filled(each.logCode, each.minimumLength + random() % 64, 0);
    for (std::size_t at = 13; at < bytes.size(); ++at) bytes[at] = static_cast<std::uint8_t>(random());
    // Otherwise hardly a list or a sub-packet would be found.
    if (turn % 2 == 0) bytes[14] = static_cast<std::uint8_t>(random() % 6);
    if (turn % 2 == 0) bytes[15] = static_cast<std::uint8_t>(random() % 6);
    fixture.take(bytes);
  }
  for (const auto& [name, value] : *fixture.state.find("Display")->dictionary())
    EXPECT_TRUE(value.string() || value.dictionary()) << name;
}

}  // namespace
}  // namespace kelvasi
