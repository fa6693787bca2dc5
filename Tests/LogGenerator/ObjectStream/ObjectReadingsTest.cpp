// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ObjectStream/ObjectReadings.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

Readings readingsOf(const PlistValue& display) {
  Readings readings;
  readings.addDisplay(display, roleOfObjectSection);
  nameObjectReadings(readings.all());
  return readings;
}

TEST(ObjectReadings, HaveTheQuantityAndTheNumberThatTheirNamesAndUnitsTell) {
  const PlistValue display = PlistDictionary::make(
      {{"Serving Cell",
        PlistDictionary::make(
            {{"UARFCN", "10612"}, {"Scrambling Code", "362"}, {"RSCP", "-95 dBm"}, {"State", "Camped"}})}});
  const Readings readings = readingsOf(display);
  ASSERT_EQ(readings.all().size(), 5u);  // a removal first
  const Reading& power = readings.all()[3];
  EXPECT_EQ(quantityOf(power), &quantity::rscp);
  EXPECT_EQ(numberOf(power), -95);
  EXPECT_EQ(textOf(power), "-95 dBm");
  EXPECT_EQ(textOf(power.cell), "umts:10612/362");
  EXPECT_EQ(quantityOf(readings.all()[4]), &quantity::text);
}

TEST(ObjectReadings, LeaveATextWithAnotherUnitOrWithMoreThanANumberAsItIs) {
  const PlistValue display = PlistDictionary::make(
      {{"RSCP", "-95 dB"}, {"Ec/No", "about -7 dB"}, {"ARFCN", "62 (PCS)"}, {"Cell ID", ""}});
  const Readings readings = readingsOf(display);
  for (const Reading& reading : readings.all().subspan(1)) {
    EXPECT_EQ(quantityOf(reading), &quantity::text) << pathOf(reading);
    EXPECT_EQ(numberOf(reading), std::nullopt);
    EXPECT_FALSE(reading.cell);
  }
}

TEST(ObjectReadings, HaveTheRoleThatTheirSectionsNameTells) {
  const auto cell = PlistDictionary::make({{"ARFCN", "62"}, {"BSIC", "13"}});
  const PlistValue display =
      PlistDictionary::make({{"02;Serving Cell", cell},
                             {"Neighbor Cells", PlistDictionary::make({{"GSM", cell}})},
                             {"Other", cell}});
  const Readings readings = readingsOf(display);
  ASSERT_EQ(readings.all().size(), 7u);  // a removal first
  EXPECT_EQ(readings.all()[1].section->role, CellRole::serving);
  EXPECT_EQ(readings.all()[3].section->role, CellRole::neighbour);
  EXPECT_EQ(readings.all()[5].section->role, CellRole::none);
}

TEST(ObjectReadings, TellTheCellsOfAListApart) {
  const auto cell = [](const char* arfcn, const char* bsic) {
    return PlistDictionary::make({{"ARFCN", arfcn}, {"BSIC", bsic}, {"Received Level", "-80 dBm"}});
  };
  const PlistValue display =
      PlistDictionary::make({{"Neighbor Cells", PlistArray::make({cell("62", "13"), cell("70", "9")})}});
  const Readings readings = readingsOf(display);
  ASSERT_EQ(readings.all().size(), 8u);  // a removal and the list first
  EXPECT_EQ(textOf(readings.all()[4].cell), "gsm:62/13");
  EXPECT_EQ(textOf(readings.all()[7].cell), "gsm:70/9");
}

}  // namespace
}  // namespace kelvasi
