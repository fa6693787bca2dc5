// SPDX-License-Identifier: Apache-2.0
// The record of transport channels and coded composite channels, and its two sections.
#include "LogGenerator/UTRAN/ChannelMeasurement.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"
#include "LogGenerator/UTRAN/UTRANTables.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::hex;
using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Bler = test::SectionFixture<TRCHBLERMeasurement>;
using Sir = test::SectionFixture<CCTRCHSIRMeasurement>;

// What stands from byte 13 on, and the composite channels from `start` on.
Bytes channels(std::string_view head, std::size_t start, std::string_view composite) {
  Bytes bytes = record(0xD00C, head, start);
  const Bytes tail = hex(composite);
  bytes.insert(bytes.end(), tail.begin(), tail.end());
  return bytes;
}

// Two transport channels and one composite channel.
Bytes typical() {
  return channels("00 8010 00  05 06  07 FF", 289 + 34 * 2, "03 04 0A 14 1E 28 32 FF");
}

TEST(TRCHBLERMeasurement, ShowsEachTransportChannelInThisOrder) {
  auto section = Bler::list();
  section.take(typical());
  EXPECT_EQ(section.text(), "[TRCH ID=5\nTRCH BLER Measurement=6\n][TRCH ID=7\nTRCH BLER Measurement=255\n]");
}

TEST(TRCHBLERMeasurement, CountsSixBitsAcrossTwoBytes) {
  auto section = Bler::list();
  section.take(record(0xD00C, "00 C00F 00"));
  EXPECT_EQ(section.section.array()->size(), 63u);
  section.take(record(0xD00C, "FF 3FF0 FF"));
  EXPECT_EQ(section.section.array()->size(), 0u);
  section.take(record(0xD00C, "00 0001 00"));
  EXPECT_EQ(section.section.array()->size(), 4u);
}

TEST(TRCHBLERMeasurement, TracesAtNoticePriority) {
  auto section = Bler::list();
  section.surroundings.log.clear();
  section.take(typical());
  EXPECT_THAT(section.surroundings.log.lines(LogPriority::notice), ElementsAre("TRCH BLER Measurement"));
  EXPECT_THAT(section.surroundings.log.warnings(), IsEmpty());
}

TEST(CCTRCHSIRMeasurement, ShowsEachCompositeChannelWithItsSixTimeslots) {
  auto section = Sir::list();
  section.take(typical());
  EXPECT_EQ(section.text(), "[CCTRCH ID=3\nTSNUM=4\nSIR=[10][20][30][40][50][255]\n]");
}

TEST(CCTRCHSIRMeasurement, RatiosThatSomebodyHoldsStayAsTheyAre) {
  auto section = Sir::list();
  section.take(typical());
  const PlistValue held = section.section.array()->at(0).dictionary()->get("SIR");
  section.take(channels("00 0010 00", 289, "03 04 01 02 03 04 05 06"));
  EXPECT_EQ(test::asText(held), "[10][20][30][40][50][255]");
  EXPECT_EQ(section.text(), "[CCTRCH ID=3\nTSNUM=4\nSIR=[1][2][3][4][5][6]\n]");
}

TEST(CCTRCHSIRMeasurement, BeginsAtByte289WithoutTransportChannels) {
  auto section = Sir::list();
  section.take(channels("00 0020 00", 289, "01 02 03 04 05 06 07 08  09 0A 0B 0C 0D 0E 0F 10"));
  EXPECT_EQ(section.text(),
            "[CCTRCH ID=1\nTSNUM=2\nSIR=[3][4][5][6][7][8]\n]"
            "[CCTRCH ID=9\nTSNUM=10\nSIR=[11][12][13][14][15][16]\n]");
}

TEST(CCTRCHSIRMeasurement, Begins34BytesLaterForEachTransportChannel) {
  for (const auto& [head, start] : {std::pair{"00 4010 00", 289 + 34}, std::pair{"00 8010 00", 289 + 68},
                                    std::pair{"00 C01F 00", 289 + 34 * 63}}) {
    auto section = Sir::list();
    section.take(channels(head, static_cast<std::size_t>(start), "03 04 0A 14 1E 28 32 FF"));
    EXPECT_EQ(section.text(), "[CCTRCH ID=3\nTSNUM=4\nSIR=[10][20][30][40][50][255]\n]") << start;
  }
}

TEST(CCTRCHSIRMeasurement, CountsFourBits) {
  auto section = Sir::list();
  section.take(record(0xD00C, "FF 00F0 FF"));
  EXPECT_EQ(section.section.array()->size(), 15u);
  section.take(record(0xD00C, "FF FF0F FF"));
  EXPECT_EQ(section.section.array()->size(), 0u);
}

TEST(CCTRCHSIRMeasurement, TracesAtWarningPriority) {
  auto section = Sir::list();
  section.surroundings.log.clear();
  section.take(typical());
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("CCTRCH SIR Measurement"));
}

TEST(ChannelMeasurement, ATimeslotPastTheSixthIsOutOfBounds) {
  const Bytes channel = hex("03 04 0A 14 1E 28 32 FF AA");
  EXPECT_EQ(utran::channelMeasurement::ratioOf(RecordView(channel), 5), 255);
  EXPECT_THROW(utran::channelMeasurement::ratioOf(RecordView(channel), 6), ArrayOutOfBoundsException);
}

TEST(ChannelMeasurement, AChannelPastItsCountIsOutOfBounds) {
  using namespace utran::channelMeasurement;
  const Bytes bytes = typical();
  EXPECT_EQ(valueOf(entryOf(RecordView(bytes), transportChannels, 1), transportLayout[0]), 7);
  EXPECT_THROW(entryOf(RecordView(bytes), transportChannels, 2), ArrayOutOfBoundsException);
  EXPECT_EQ(valueOf(entryOf(RecordView(bytes), compositeChannels, 0), compositeLayout[0]), 3);
  EXPECT_THROW(entryOf(RecordView(bytes), compositeChannels, 1), ArrayOutOfBoundsException);
}

template <typename Section>
void expectListToOutlastShortRecordsAndOtherCodes() {
  auto section = Section::list();
  section.take(typical());
  const std::string before = section.text();
  section.take(record(0xD00C, "00 0000", 16));
  section.take(record(0xD00A, "00 0000 00", 64));
  EXPECT_EQ(section.text(), before);
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
  section.take(record(0xD00C, "00 0000", 17));
  EXPECT_EQ(section.text(), "");
}

TEST(TRCHBLERMeasurement, OutlastsShortRecordsAndOtherCodes) {
  expectListToOutlastShortRecordsAndOtherCodes<Bler>();
}

TEST(CCTRCHSIRMeasurement, OutlastsShortRecordsAndOtherCodes) {
  expectListToOutlastShortRecordsAndOtherCodes<Sir>();
}

}  // namespace
}  // namespace kelvasi
