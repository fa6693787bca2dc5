// SPDX-License-Identifier: Apache-2.0
#include "Capture/TechnologyCount.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Telvon/Technology.h"
#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

const Bytes gsm = hex("01 0F00 3171 0000000000000000 130802");
const Bytes cdma = hex("01 0D00 8A10 0000000000000000 00");
const Bytes lte = hex("01 0D00 7FB1 0000000000000000 00");
const Bytes utran = hex("01 0D00 0AD0 0000000000000000 00");
const Bytes ifx = bytesOf("<?xml version=\"1.0\"?><plist/>");
const Bytes simFiles = hex("FF 0D00 0000 0000000000000000 00");
const Bytes unknown = hex("01 0D00 3412 0000000000000000 00");

struct TechnologyCountTest : ::testing::Test {
  void take(std::initializer_list<Bytes> messages) {
    for (const Bytes& message : messages) count.count(message);
  }

  const TechnologyCodes codes;
  TechnologyCount count{codes};
};

TEST_F(TechnologyCountTest, TellsEachTechnologyByWhatItAsksFor) {
  const std::pair<Bytes, std::string_view> known[]{
      {gsm, kTelvonLogChannelTechnology_Orvane_GSM},
      {cdma, kTelvonLogChannelTechnology_Orvane_CDMA},
      {lte, kTelvonLogChannelTechnology_Orvane_LTE},
      {utran, kTelvonLogChannelTechnology_Orvane_UTRAN2},
      {ifx, kTelvonLogChannelTechnology_IFX},
      {bytesOf("bplist00"), kTelvonLogChannelTechnology_IFX},
      {hex("81 00") + lte, kTelvonLogChannelTechnology_Orvane_LTE},
  };
  for (const auto& [message, technology] : known) {
    TechnologyCount one(codes);
    one.count(message);
    EXPECT_THAT(one.ranking(), ElementsAre(technology));
    EXPECT_EQ(one.of(technology), 1u);
    EXPECT_FALSE(one.fitsNone());
  }
}

TEST_F(TechnologyCountTest, RanksThemByTheirMessages) {
  take({gsm, lte, unknown, lte, simFiles, utran, lte, utran});
  EXPECT_THAT(count.ranking(),
              ElementsAre(kTelvonLogChannelTechnology_Orvane_LTE, kTelvonLogChannelTechnology_Orvane_UTRAN2,
                          kTelvonLogChannelTechnology_Orvane_GSM));
  EXPECT_EQ(count.text(count.ranking()),
            "Orvane_LTE (3 of 8 messages), Orvane_UTRAN2 (2) and Orvane_GSM (1)");
}

TEST_F(TechnologyCountTest, TheDaemonsOwnRecordsTellNoTechnology) {
  take({simFiles, unknown});
  EXPECT_THAT(count.ranking(), IsEmpty());
  EXPECT_FALSE(count.fitsNone());
}

TEST_F(TechnologyCountTest, FitsNoneWhereNobodyAsksForAnyMessage) {
  EXPECT_FALSE(count.fitsNone());
  take({unknown, {}, hex("01"), hex("FF 0D")});
  EXPECT_TRUE(count.fitsNone());
  take({gsm});
  EXPECT_FALSE(count.fitsNone());
}

}  // namespace
}  // namespace kelvasi
