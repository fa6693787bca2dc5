// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<ServingCellMeasurement>;

constexpr auto typical = "04 000000 9C18 F70B C892 419F 9F94 1A0D BCE1 A326";

std::string row(const Section& section, std::string_view key) {
  return *section.section.dictionary()->get(key).string();
}

TEST(ServingCellMeasurement, ShowsAllRowsInThisOrder) {
  auto section = Section::rows();
  section.take(record(0xB17F, typical));
  EXPECT_EQ(section.text(),
            "Version=4\n"
            "E-ARFCN=6300\n"
            "Physical Cell ID=503\n"
            "Serving Layer Priority=5\n"
            "Measured RSRP=-90.00 dBm\n"
            "Average RSRP=-89.75 dBm\n"
            "Measured RSRQ=-10.00 dB\n"
            "Average RSRQ=-10.25 dB\n"
            "Measured RSSI=-60.50 dBm\n"
            "Qrxlevmin=-120 dBm\n"
            "P_Max=23 dBm\n"
            "Max UE Tx Power=22 dBm\n"
            "Srxlev=30 dBm\n"
            "Num of Consecutive DRX Cycles of S < 0=3\n"
            "S Intra Search=62 dB\n"
            "S Non Intra Search=40 dBm\n"
            "Measurement Rules Updated=True\n"
            "Measurement Rules=9\n");
}

TEST(ServingCellMeasurement, ShowsTheSmallestValues) {
  auto section = Section::rows();
  section.take(record(0xB17F, "", 33));
  EXPECT_EQ(section.text(),
            "Version=0\n"
            "E-ARFCN=0\n"
            "Physical Cell ID=0\n"
            "Serving Layer Priority=0\n"
            "Measured RSRP=-140.00 dBm\n"
            "Average RSRP=-140.00 dBm\n"
            "Measured RSRQ=-30.00 dB\n"
            "Average RSRQ=-30.00 dB\n"
            "Measured RSSI=-140.00 dBm\n"
            "Qrxlevmin=-140 dBm\n"
            "P_Max=-30 dBm\n"
            "Max UE Tx Power=-30 dBm\n"
            "Srxlev=-30 dBm\n"
            "Num of Consecutive DRX Cycles of S < 0=0\n"
            "S Intra Search=0 dB\n"
            "S Non Intra Search=0 dBm\n"
            "Measurement Rules Updated=False\n"
            "Measurement Rules=0\n");
}

struct FieldSet {
  const char* key;
  const char* bytes;  // all bits of the field set, all others clear
  const char* text;
};

class ServingCellMeasurementField : public testing::TestWithParam<FieldSet> {};

TEST_P(ServingCellMeasurementField, SetAloneChangesItsOwnRowAlone) {
  auto all = Section::rows();
  all.take(record(0xB17F, "", 33));
  auto section = Section::rows();
  section.take(record(0xB17F, GetParam().bytes, 33));
  EXPECT_EQ(row(section, GetParam().key), GetParam().text);
  section.section.dictionary()->setText(GetParam().key, row(all, GetParam().key));
  EXPECT_EQ(section.text(), all.text());
}

INSTANTIATE_TEST_SUITE_P(
    All, ServingCellMeasurementField,
    testing::Values(
        FieldSet{"Version", "FF", "255"}, FieldSet{"E-ARFCN", "00000000 FFFF", "65535"},
        FieldSet{"Physical Cell ID", "000000000000 FF01", "511"},
        FieldSet{"Serving Layer Priority", "00000000000000 1E", "15"},
        FieldSet{"Measured RSRP", "0000000000000000 FF01", "-12.25 dBm"},
        FieldSet{"Average RSRP", "000000000000000000 FE03", "-12.25 dBm"},
        FieldSet{"Measured RSRQ", "00000000000000000000 FC01", "1.75 dB"},
        FieldSet{"Average RSRQ", "0000000000000000000000 FE", "1.75 dB"},
        FieldSet{"Measured RSSI", "000000000000000000000000 FF01", "115.50 dBm"},
        FieldSet{"Qrxlevmin", "00000000000000000000000000 7E", "-14 dBm"},
        FieldSet{"P_Max", "00000000000000000000000000 803F", "97 dBm"},
        FieldSet{"Max UE Tx Power", "0000000000000000000000000000 C00F", "33 dBm"},
        FieldSet{"Srxlev", "00000000000000000000000000000000 7F", "97 dBm"},
        FieldSet{"Num of Consecutive DRX Cycles of S < 0", "00000000000000000000000000000000 801F", "63"},
        FieldSet{"S Intra Search", "0000000000000000000000000000000000 E007", "126 dB"},
        FieldSet{"S Non Intra Search", "000000000000000000000000000000000000 F801", "126 dBm"},
        FieldSet{"Measurement Rules Updated", "00000000000000000000000000000000000000 02", "True"},
        FieldSet{"Measurement Rules", "00000000000000000000000000000000000000 3C", "15"},
        FieldSet{"P_Max", "00000000000000000000000000 0020", "Not Present"},
        FieldSet{"S Intra Search", "0000000000000000000000000000000000 0004", "Not Present"},
        FieldSet{"S Intra Search", "0000000000000000000000000000000000 E003", "62 dB"},
        FieldSet{"S Non Intra Search", "000000000000000000000000000000000000 0001", "Not Present"}));

// The seventh bit of P-Max says 64; of the handset's power it would be a bit of the gap behind it.
TEST(ServingCellMeasurement, TheHandsetsPowerIsNeverNotPresent) {
  for (unsigned raw = 0; raw < 64; ++raw) {
    auto section = Section::rows();
    Bytes bytes = record(0xB17F, "", 33);
    bytes[27] = static_cast<std::uint8_t>(raw << 6);
    bytes[28] = static_cast<std::uint8_t>(0xF0 | raw >> 2);
    section.take(bytes);
    EXPECT_EQ(row(section, "Max UE Tx Power"), std::to_string(static_cast<int>(raw) - 30) + " dBm");
  }
}

TEST(ServingCellMeasurement, TheSearchOfOtherLayersIsInDbmTheOneOfTheOwnInDb) {
  auto section = Section::rows();
  section.take(record(0xB17F, "0000000000000000000000000000000000 E0FB 00"));
  EXPECT_EQ(row(section, "S Intra Search"), "62 dB");
  EXPECT_EQ(row(section, "S Non Intra Search"), "62 dBm");
}

TEST(ServingCellMeasurement, TheBitsBetweenTheFieldsAreNotShown) {
  auto zero = Section::rows();
  zero.take(record(0xB17F, "", 33));
  auto section = Section::rows();
  section.take(record(0xB17F, "00 FFFFFF 0000 00E0 00000000000000 F0 000000 C0"));
  EXPECT_EQ(section.text(), zero.text());
}

TEST(ServingCellMeasurement, ARecordOf32BytesChangesNothing) {
  auto section = Section::rows();
  Bytes bytes = record(0xB17F, typical);
  ASSERT_EQ(bytes.size(), 33u);
  bytes.pop_back();
  section.take(bytes);
  EXPECT_EQ(section.text(), "");
}

TEST(ServingCellMeasurement, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xB179, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Serving Cell Measurements"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45433"));
}

}  // namespace
}  // namespace kelvasi
