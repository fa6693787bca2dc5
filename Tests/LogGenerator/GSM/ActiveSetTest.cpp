// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ActiveSet.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<ActiveSet>;

// Entries of 15 and 44 bytes. Identities carry scrambling codes 291 and 511 and memberships 0 and 1.
constexpr auto member291 = "00000000000000 2301 000000000000 ";
constexpr auto other511 = "00000000000000 FF21 000000000000 ";
constexpr auto unusedEnergy =
    "0000000000000000 0000000000000000 0000000000000000 0000000000000000 ";  // then three words
constexpr auto energy524288 = "00000800 00000000 00000000 ";
constexpr auto energy16904 = "08420000 00000000 00000000 ";

std::string withEnergy(std::string_view energies) {
  return unusedEnergy + std::string(energies);
}

// One cell of the active set at 0 dB.
Bytes oneCell(const std::string& agc) {
  return record(0x417A, agc + " 01 " + member291 + withEnergy(energy524288));
}

std::string rscpAt(const std::string& agc) {
  auto section = Section::list();
  section.take(oneCell(agc));
  const std::string text = section.text();
  const auto begin = text.find("RSCP=") + 5;
  return text.substr(begin, text.find('\n', begin) - begin);
}

TEST(ActiveSet, ShowsCodePowerAndEnergyOfACellInThisOrder) {
  auto section = Section::list();
  section.take(oneCell("0000"));
  EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n]");
}

TEST(ActiveSet, TheScramblingCodeIs13BitsWide) {
  auto section = Section::list();
  section.take(record(0x417A, std::string("0000 01 00000000000000 FF1F 000000000000") + withEnergy("")));
  EXPECT_EQ(section.text(), "[Scrambling Code=8191\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n]");
}

TEST(ActiveSet, ThePowerTruncatesTowardZero) {
  EXPECT_EQ(rscpAt("00FE"), "-106 dB");  // AGC -512
  EXPECT_EQ(rscpAt("0000"), "-55 dB");
  EXPECT_EQ(rscpAt("F5FD"), "-107 dB");  // AGC -523
}

TEST(ActiveSet, SkipsCellsOfOtherSetsAndTakesEachCellsOwnEnergy) {
  auto section = Section::list();
  section.take(record(0x417A, std::string("0000 02 ") + other511 + member291 + withEnergy(energy524288) +
                                  withEnergy(energy16904)));
  EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-70 dB\nEnergy Per Chip=-15 dB\n]");
}

TEST(ActiveSet, EveryMembershipButZeroIsAnotherSet) {
  for (const char* identity : {"FF21", "FF41", "FF61", "FF81", "FFA1", "FFC1", "FFE1"}) {
    auto section = Section::list();
    section.take(oneCell("0000"));
    section.take(record(0x417A, std::string("0000 01 00000000000000 ") + identity + "000000000000" +
                                    withEnergy(energy524288)));
    EXPECT_EQ(section.text(), "") << identity;
  }
}

TEST(ActiveSet, TheFirstEnergyThatIsNotZeroCounts) {
  for (const char* energies :
       {"08420000 00000800 00000800", "00000000 08420000 00000800", "00000000 00000000 08420000"}) {
    auto section = Section::list();
    section.take(record(0x417A, std::string("0000 01 ") + member291 + withEnergy(energies)));
    EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-70 dB\nEnergy Per Chip=-15 dB\n]") << energies;
  }
}

TEST(ActiveSet, ACellWithoutEnergyShowsWhatTheLadderGivesForZero) {
  auto section = Section::list();
  section.take(record(0x417A, std::string("0000 01 ") + member291 + withEnergy("")));
  EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n]");
}

TEST(ActiveSet, EnergyIsUnsigned) {
  auto section = Section::list();
  section.take(record(0x417A, std::string("0000 01 ") + member291 + withEnergy("FFFFFFFF")));
  EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n]");
}

TEST(ActiveSet, ACountOfZeroEmptiesTheSet) {
  auto section = Section::list();
  section.take(oneCell("0000"));
  section.take(record(0x417A, "0000 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(ActiveSet, ARecordOf15BytesLeavesTheSetAsItWas) {
  auto section = Section::list();
  section.take(oneCell("0000"));
  section.take(record(0x417A, "0000"));
  EXPECT_EQ(section.text(), "[Scrambling Code=291\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n]");
}

TEST(ActiveSet, CellsPastTheEndReadAsZero) {
  auto section = Section::list();
  section.take(record(0x417A, "0000 FF"));
  ASSERT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)),
            "Scrambling Code=0\nRSCP=-55 dB\nEnergy Per Chip=0 dB\n");
}

}  // namespace
}  // namespace kelvasi
