// SPDX-License-Identifier: Apache-2.0
// Records of every length, with every count field at its most, and of any bytes, for every decoder of every
// class index; also for the sanitizers to watch.
#include <gmock/gmock.h>

#include <array>
#include <random>

#include "Tests/LogGenerator/Sections/EverySection.h"

namespace kelvasi {
namespace {

using testing::Each;

constexpr std::array<std::uint8_t, 2> fills{0xFF, 0x01};

template <typename Index>
struct RecordSweep : testing::Test {
  using Sections = test::EverySection<Index>;

  // Its decoders without sections, to ask what they say.
  Sections asked;
  std::vector<LogCode> codes = test::recordCodesOf(asked.index);
};
TYPED_TEST_SUITE(RecordSweep, test::ClassIndexes, test::IndexName);

TYPED_TEST(RecordSweep, TheRequiredRecordsAreTakenFromTheirLengthOn) {
  for (const auto& required : test::Required<TypeParam>::lengths)
    EXPECT_EQ(this->asked.minimumLength(required.logCode), required.minimum) << required.logCode;
}

template <typename Index>
void expectNoChange(test::EverySection<Index>& sections, LogCode code, std::size_t minimum) {
  const std::string before = sections.shown();
  for (std::size_t length = 0; length < minimum; ++length) {
    EXPECT_THAT(sections.take(code, length, 0xFF), Each(Outcome::tooShort)) << code << " of " << length;
    EXPECT_EQ(sections.shown(), before) << code << " of " << length;
  }
}

// Neither empty sections nor those that a whole record has filled.
TYPED_TEST(RecordSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const LogCode code : this->codes) {
    const std::size_t minimum = this->asked.minimumLength(code);
    typename TestFixture::Sections sections;
    sections.bind(code);
    expectNoChange(sections, code, minimum);
    sections.take(code, minimum + 64, 0x01);
    expectNoChange(sections, code, minimum);
  }
}

TYPED_TEST(RecordSweep, RecordsOfTheirMinimumAreTakenAndShowRows) {
  for (const LogCode code : this->codes) {
    const std::size_t minimum = this->asked.minimumLength(code);
    for (std::size_t length = minimum; length <= minimum + 2; ++length) {
      std::string shown;
      for (const std::uint8_t fill : fills) {
        typename TestFixture::Sections sections;
        sections.bind(code);
        EXPECT_THAT(sections.take(code, length, fill), Each(Outcome::shown)) << code << " of " << length;
        shown += sections.shown();
      }
      EXPECT_EQ(!shown.empty(), test::showsRows<TypeParam>(code)) << code << " of " << length;
    }
  }
}

// Counts of all ones over records that end inside the first entries, inside later ones, and behind the last.
TYPED_TEST(RecordSweep, ListsAreReadWhereverTheRecordEnds) {
  for (const LogCode code : this->codes) {
    typename TestFixture::Sections sections;
    sections.surroundings.log.isMasked = true;
    sections.bind(code);
    for (std::size_t length = 0; length <= 700; ++length) sections.take(code, length, 0xFF);
    for (const std::size_t length : {2500U, 5000U}) {
      EXPECT_THAT(sections.take(code, length, 0xFF), Each(Outcome::shown)) << code;
    }
  }
}

// Without a display to write into; with one, the decoders then show rows as ever.
TYPED_TEST(RecordSweep, UnboundSectionsTakeEveryRecord) {
  for (const LogCode code : this->codes) {
    typename TestFixture::Sections sections;
    const std::size_t minimum = sections.minimumLength(code);
    for (const std::uint8_t fill : fills)
      EXPECT_THAT(sections.take(code, minimum + 2, fill), Each(Outcome::sectionMissing)) << code;
    sections.bind(code);
    std::string shown;
    for (const std::uint8_t fill : fills) {
      EXPECT_THAT(sections.take(code, minimum + 2, fill), Each(Outcome::shown)) << code;
      shown += sections.shown();
    }
    EXPECT_EQ(!shown.empty(), test::showsRows<TypeParam>(code)) << code;
  }
}

// Of texts, lists and dictionaries, as asText says.
TYPED_TEST(RecordSweep, RandomRecordsLeaveNothingButTexts) {
  std::mt19937 random(7);
  typename TestFixture::Sections sections;
  sections.surroundings.log.isMasked = true;
  for (const LogCode code : this->codes) sections.bind(code);
  for (int turn = 0; turn < 3000; ++turn) {
    const LogCode code = this->codes[random() % this->codes.size()];
    Bytes bytes = test::filled(code, this->asked.minimumLength(code) + random() % 200, 0);
    for (std::size_t at = 13; at < bytes.size(); ++at) bytes[at] = static_cast<std::uint8_t>(random());
    EXPECT_THAT(sections.take(code, bytes), Each(Outcome::shown)) << code;
  }
  EXPECT_EQ(sections.shown().find("neither text nor container"), std::string::npos);
}

}  // namespace
}  // namespace kelvasi
