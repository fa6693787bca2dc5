// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowBook.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

class RowBookTest : public testing::Test {
 protected:
  void take(Message message) {
    messages_.push_back(std::move(message));
    book_.take(messages_.back(),
               [this](const std::string& path, const BookedRow&) { written_.push_back(path); });
  }
  void takeDisplay(Arrival after, const PlistValue& display) {
    Readings readings;
    readings.begin(noon + after, 0);
    readings.addRemovalOfEverything();
    readings.addDisplay(display);
    book_.take(readings, [](const std::string&, const BookedRow&) {});
  }

  RowBook book_;
  std::vector<std::string> written_;

 private:
  std::deque<Message> messages_;
};

TEST_F(RowBookTest, KeepsWhatARowWasLast) {
  take(Message(0s).plain(quantity::txPower, 5));
  take(Message(2s).plain(quantity::txPower, -7));
  take(Message(3s).plain(quantity::txPower, 1));
  take(Message(9s).plain(quantity::txPower, 1));
  const BookedRow* row = book_.find("/Plain/tx_power");
  ASSERT_TRUE(row);
  EXPECT_EQ(row->text(), "1");
  EXPECT_EQ(row->number(), 1);
  EXPECT_EQ(row->minimum, -7);
  EXPECT_EQ(row->maximum, 5);
  EXPECT_EQ(row->since, noon);
  EXPECT_EQ(row->changed, noon + 3s);
  EXPECT_EQ(row->last, noon + 9s);
  EXPECT_EQ(row->writings, 4U);
  EXPECT_EQ(written_.size(), 4U);
  EXPECT_EQ(book_.find(row->id), row);
}

TEST_F(RowBookTest, BeginsAnewWithAnotherCell) {
  take(served(0s, cell404, -95));
  take(served(1s, cell362, -80));
  const BookedRow* row = book_.find("/Serving/rsrp");
  ASSERT_TRUE(row);
  EXPECT_EQ(row->cell, cell362);
  EXPECT_EQ(row->minimum, -80);
  EXPECT_EQ(row->maximum, -80);
  EXPECT_EQ(row->since, noon + 1s);
  EXPECT_EQ(row->writings, 1U);
}

TEST_F(RowBookTest, APartOfTheCellIsNoOtherCell) {
  constexpr CellIdentity whole{RadioFamily::gsm, 80, 17};
  constexpr CellIdentity part{RadioFamily::gsm, 80};
  take(Message(0s).serving(whole, quantity::rxlev, 42));
  take(Message(1s).serving(part, quantity::rxlev, 40));
  EXPECT_EQ(book_.find("/Serving/rxlev")->writings, 2U);
  EXPECT_EQ(book_.find("/Serving/rxlev")->maximum, 42);
  EXPECT_EQ(book_.find("/Serving/rxlev")->cell, part);
}

TEST_F(RowBookTest, ARemovedRowIsRememberedAndComesBack) {
  const auto display = [](const char* key) {
    return PlistValue(PlistDictionary::make({{"Section", PlistDictionary::make({{key, "5"}})}}));
  };
  takeDisplay(0s, display("Row"));
  takeDisplay(1s, display("Row 2"));
  ASSERT_TRUE(book_.find("/Section/Row"));
  EXPECT_FALSE(book_.find("/Section/Row")->isPresent);
  EXPECT_TRUE(book_.find("/Section/Row 2")->isPresent);
  takeDisplay(2s, display("Row"));
  EXPECT_TRUE(book_.find("/Section/Row")->isPresent);
  EXPECT_EQ(book_.find("/Section/Row")->changed, noon);
  EXPECT_EQ(book_.find("/Section/Row")->text(), "5");
}

// "/List 2" stands between "/List" and "/List/0" and is neither.
TEST_F(RowBookTest, RemovesARowWithAllBelowItAndNothingElse) {
  const ReadingSection section{.name = "List", .path = "/List"};
  const ReadingSection other{.name = "List 2", .path = "/List 2"};
  const PlistValue text("1");
  Readings readings;
  readings.begin(noon, 0);
  for (const ReadingSection* each : {&section, &other}) {
    Reading reading;
    reading.kind = Reading::Kind::value;
    reading.section = each;
    reading.entry = 0;
    reading.key = "RSRP";
    reading.value = &text;
    readings.add(reading);
  }
  readings.addRemovals(section, {}, 1);
  book_.take(readings, [](const std::string&, const BookedRow&) {});
  ASSERT_TRUE(book_.find("/List/0/RSRP"));
  EXPECT_FALSE(book_.find("/List/0/RSRP")->isPresent);
  EXPECT_TRUE(book_.find("/List 2/0/RSRP")->isPresent);
  EXPECT_TRUE(book_.find("/List 2/0/RSRP")->isInList);
}

TEST_F(RowBookTest, IsBounded) {
  const auto display = PlistDictionary::make();
  for (std::size_t row = 0; row < RowBook::mostRows + 3; ++row)
    display->set("Row " + std::to_string(row), "x");
  takeDisplay(0s, PlistDictionary::make({{"Section", display}}));
  EXPECT_EQ(book_.all().size(), RowBook::mostRows);
  EXPECT_EQ(book_.dropped(), 3U);
}

}  // namespace
}  // namespace kelvasi::cockpit
