// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowSheet.h"

#include <gtest/gtest.h>

#include "Cockpit/Rows/QuantityWords.h"
#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

TEST(RowSheet, SaysAllOfARow) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  fed.take(served(60s, cell404, -101));
  fed.take(served(70s, cell404, -101));
  const auto sheet = fed.cockpit.sheet("/Serving/rsrp", noon + 75s);
  ASSERT_TRUE(sheet);
  EXPECT_EQ(sheet->name, "rsrp");
  EXPECT_EQ(sheet->place, "Serving");
  EXPECT_EQ(sheet->nodePath, "/Serving/rsrp");
  EXPECT_EQ(sheet->cellText, "LTE 3350/404");
  EXPECT_EQ(sheet->value, "-101");
  EXPECT_EQ(sheet->decimal, "-101");
  EXPECT_EQ(sheet->hexadecimal, "0xFFFFFF9B");
  EXPECT_EQ(sheet->quantityName, "RSRP");
  EXPECT_EQ(sheet->unit, "dBm");
  EXPECT_EQ(sheet->source, "3GPP TS 36.214, 5.1.1");
  EXPECT_EQ(sheet->age.text, "5 s");
  EXPECT_EQ(sheet->minimum, "-101 dBm");
  EXPECT_EQ(sheet->maximum, "-95 dBm");
  EXPECT_EQ(sheet->sinceText, "00:00:00");
  EXPECT_EQ(sheet->changedText, "15 s ago, 00:01:00");
  EXPECT_EQ(sheet->writings, 3U);
  EXPECT_TRUE(sheet->canChart);
  EXPECT_EQ(sheet->ruleBegin, "rsrp");
}

TEST(RowSheet, ATextHasNoNumbers) {
  Fed fed;
  Readings readings;
  readings.begin(noon, 0);
  readings.addDisplay(PlistDictionary::make({{"SIM", PlistDictionary::make({{"Name", "Test Network"}})}}));
  fed.cockpit.take(readings, fed.intake);
  const auto sheet = fed.cockpit.sheet("/SIM/Name", noon);
  ASSERT_TRUE(sheet);
  EXPECT_EQ(sheet->value, "Test Network");
  EXPECT_EQ(sheet->decimal, "");
  EXPECT_EQ(sheet->minimum, "");
  EXPECT_FALSE(sheet->canChart);
  EXPECT_EQ(sheet->changedText, "not since 00:00:00");
  EXPECT_FALSE(fed.cockpit.sheet("/SIM", noon));
}

TEST(RowSheet, AnIdentityHasNoCourse) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  const auto sheet = fed.cockpit.sheet("/Serving/pci", noon);
  ASSERT_TRUE(sheet);
  EXPECT_EQ(sheet->hexadecimal, "0x194");
  EXPECT_EQ(sheet->minimum, "");
  EXPECT_FALSE(sheet->canChart);
}

TEST(RowSheet, ItsLinesLeaveOutWhatIsNotThere) {
  Fed fed;
  fed.take(Message(0s).plain(quantity::count, 5));
  const auto sheet = fed.cockpit.sheet("/Plain/count", noon);
  ASSERT_TRUE(sheet);
  std::string captions;
  for (const auto& [caption, text] : sheet->lines()) captions += caption + "=" + text + "\n";
  EXPECT_EQ(
      captions,
      "Value=5\nDecimal=5\nHexadecimal=0x5\nQuantity=count\nMeaning=How many.\nAge=live\nMinimum=5\n"
      "Maximum=5\nBoth since=00:00:00\nLast change=not since 00:00:00\nWritten=1 time\nPath=/Plain/count\n");
}

TEST(RowSheet, ANumberOnACurveHasNoRawDigits) {
  Fed fed;
  Message message(0s);
  message.level(cell404, quantity::rsrp, -95.5);
  fed.take(message);
  const auto sheet = fed.cockpit.sheet("/Serving/rsrp", noon);
  ASSERT_TRUE(sheet);
  EXPECT_EQ(sheet->number, -95.5);
  EXPECT_EQ(sheet->decimal, "");
  EXPECT_EQ(sheet->hexadecimal, "");
  EXPECT_EQ(sheet->minimum, "-95.5 dBm");
}

TEST(QuantityWords, EveryQuantityHasThem) {
  for (const Quantity* quantity : quantity::all) {
    if (quantity == &quantity::none) continue;
    EXPECT_NE(wordsOf(*quantity).name, "") << quantity->id;
    const bool isDefined = quantity->kind != QuantityKind::none && quantity->kind != QuantityKind::text &&
                           quantity->kind != QuantityKind::container;
    const auto meaning = wordsOf(*quantity).meaning;
    EXPECT_EQ(!meaning.empty() && meaning.back() == '.', isDefined) << quantity->id;
  }
}

TEST(QuantityWords, AnUnknownOneIsCalledByItsIdentifier) {
  static constexpr Quantity other{"other", "", QuantityKind::count, 0, 1, ""};
  EXPECT_EQ(wordsOf(other).name, "other");
}

}  // namespace
}  // namespace kelvasi::cockpit
