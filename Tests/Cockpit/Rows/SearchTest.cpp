// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/Search.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

class SearchTest : public testing::Test {
 protected:
  SearchTest() {
    show({{"1;Cells", PlistDictionary::make({{"RSRP Range", "7"}, {"Average RSRP", "-97"}, {"RSRP", "-95"}})},
          {"RSRP Rules", PlistDictionary::make({{"Version", "1"}})},
          {"State", PlistDictionary::make({{"Reason", "rsrp too low"}, {"Name", "Test"}})}});
  }
  void show(std::initializer_list<PlistDictionary::Entry> display) {
    Readings readings;
    readings.begin(noon, 0);
    readings.addRemovalOfEverything();
    readings.addDisplay(PlistDictionary::make(display));
    book_.take(readings, [](const std::string&, const BookedRow&) {});
  }
  std::vector<std::string> names(std::string_view text, std::size_t most = 50) const {
    std::vector<std::string> names;
    for (const Found& found : search(book_, text, noon, most).rows) names.push_back(found.name);
    return names;
  }

  RowBook book_;
};

using Names = std::vector<std::string>;

TEST_F(SearchTest, NamesBeforePlacesBeforeValues) {
  EXPECT_EQ(names("RSRP"), (Names{"RSRP", "RSRP Range", "Average RSRP", "Version", "Reason"}));
}

TEST_F(SearchTest, CaseDoesNotMatter) {
  EXPECT_EQ(names("rsrp r"), names("RSRP R"));
  EXPECT_EQ(names("aVERAGE"), Names{"Average RSRP"});
}

TEST_F(SearchTest, EveryWordHasToBeThere) {
  EXPECT_EQ(names("cells rsrp"), (Names{"Average RSRP", "RSRP", "RSRP Range"}));
  EXPECT_EQ(names("cells version"), Names{});
  EXPECT_EQ(names("  test  "), Names{"Name"});
}

TEST_F(SearchTest, NothingForNothing) {
  EXPECT_EQ(names(""), Names{});
  EXPECT_EQ(names("   "), Names{});
  EXPECT_EQ(search(book_, "", noon).words, "");
}

TEST_F(SearchTest, GivesPathAndLiveValue) {
  const SearchResult result = search(book_, "average", noon + 7s);
  ASSERT_EQ(result.rows.size(), 1U);
  EXPECT_EQ(result.rows[0].path, "/1;Cells/Average RSRP");
  EXPECT_EQ(result.rows[0].nodePath, "/Cells/Average RSRP");
  EXPECT_EQ(result.rows[0].place, "Cells");
  EXPECT_EQ(result.rows[0].value, "-97");
  EXPECT_EQ(result.rows[0].age.text, "7 s");
}

TEST_F(SearchTest, IsBoundedAndSaysSo) {
  EXPECT_EQ(names("rsrp", 2), (Names{"RSRP", "RSRP Range"}));
  EXPECT_EQ(search(book_, "rsrp", noon, 2).words, "2 of 5 rows");
  EXPECT_EQ(search(book_, "rsrp", noon).words, "5 rows");
  EXPECT_EQ(search(book_, "average", noon).words, "1 row");
  EXPECT_EQ(search(book_, "rsrq", noon).words, "No row with this name or value");
}

TEST_F(SearchTest, OnlyWhatIsOnTheDisplay) {
  show({{"Other", PlistDictionary::make({{"Row", "1"}})}});
  EXPECT_EQ(names("rsrp"), Names{});
}

TEST(CockpitSearch, FindsACellByItsName) {
  Fed fed;
  Message message = served(0s, cell404, -95);
  message.neighbour(cell362, quantity::rsrp, -105);
  fed.take(message);
  const auto result = fed.cockpit.search("pci 362", noon);
  ASSERT_EQ(result.rows.size(), 1U);
  EXPECT_EQ(result.rows[0].cellText, "LTE 3350/362");
  EXPECT_EQ(fed.cockpit.rowPath("/Neighbours/0/rsrp"), "/Neighbours/0/rsrp");
  EXPECT_EQ(fed.cockpit.rowPath("/Neighbours"), std::nullopt);
}

}  // namespace
}  // namespace kelvasi::cockpit
