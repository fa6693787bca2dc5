// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiSaveViewController.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/AppFixture.h"

namespace kelvasi {
namespace {

using test::MemoryCellBody;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

struct ClosingShell : SaveShell {
  bool allowSaveButton() const override { return true; }
  void showSaveView() override {}
  void closeSaveView() override { ++closings; }
  void keepDescription(std::string description) override { kept.push_back(std::move(description)); }
  std::vector<std::string> kept;
  int closings = 0;
};

PlistValue entry(const char* text) {
  return PlistDictionary::make({{"Display", "shown"}, {"Description", text}});
}

class KelvasiSaveViewControllerTest : public testing::Test, protected test::AppFixture {
 protected:
  void open(const PlistValue& saveHistory) {
    controller = std::make_unique<KelvasiSaveViewController>(platform(), shell, saveHistory);
    controller->loadViewIfNeeded();
    controller->viewWillAppear(true);
    ui.interface->table.show({0, 20});
  }
  test::MemoryInterface& interface() const { return *ui.interface; }
  test::MemoryTextField& field() const { return ui.interface->field; }
  std::string keysWritten() const {
    const Bytes& bytes = files.written.at("/logs/KelvasiSnapshot-1709647629.kelvasi");
    return std::string(bytes.begin(), bytes.end());
  }

  ClosingShell shell;
  std::unique_ptr<KelvasiSaveViewController> controller;
};

TEST_F(KelvasiSaveViewControllerTest, ListsTheEntriesByTheirDescriptionsAllChecked) {
  open(PlistArray::make({entry("Snapshot (today)"), entry("DLF binary (7 bytes)")}));
  ASSERT_EQ(interface().table.rows(), 2U);
  EXPECT_EQ(interface().table.sections(), 1U);
  const auto& body = static_cast<MemoryCellBody&>(interface().table.cell(1).body());
  auto& label = const_cast<MemoryCellBody&>(body).textLabel();
  EXPECT_EQ(label.text(), "DLF binary (7 bytes)");
  EXPECT_EQ(label.fontSet, (Font{.family = "Helvetica", .size = 13.0, .isBold = false}));
  EXPECT_EQ(body.accessory, CellAccessory::checkmark);
  EXPECT_EQ(body.style, CellStyle::oneLabel);
  EXPECT_EQ(interface().table.cell(1).reuseIdentifier(), "SaveHistoryContentCell");
}

TEST_F(KelvasiSaveViewControllerTest, UsesACellAgain) {
  open(PlistArray::make({entry("first"), entry("second")}));
  interface().table.show({1, 2});
  interface().table.show({0, 1});
  EXPECT_EQ(interface().table.cellsMade, 2);
  EXPECT_EQ(interface().table.body(0).textLabel().text(), "first");
}

TEST_F(KelvasiSaveViewControllerTest, WithoutSaveContentsTheListIsEmpty) {
  open(PlistValue());
  EXPECT_EQ(interface().table.rows(), 0U);
}

TEST_F(KelvasiSaveViewControllerTest, LoadingTakesTheFieldAndFitsTheTable) {
  controller = std::make_unique<KelvasiSaveViewController>(platform(), shell, PlistValue());
  EXPECT_EQ(field().delegate, nullptr);
  EXPECT_EQ(interface().table.fittings, 0);
  controller->loadViewIfNeeded();
  EXPECT_NE(field().delegate, nullptr);
  EXPECT_EQ(interface().table.fittings, 1);
}

TEST_F(KelvasiSaveViewControllerTest, TakesTheScreenLessTheStatusBar) {
  open(PlistValue());
  EXPECT_EQ(interface().view().frameSet, (Rect{0, 20, 320, 460}));
}

TEST_F(KelvasiSaveViewControllerTest, SaveWritesTheSnapshotAndClosesTheViewLater) {
  open(PlistArray::make({entry("first")}));
  field().typed = "in the lift";
  interface().use("savePressed");
  EXPECT_EQ(keysWritten(), "TimestampDataDescription");
  EXPECT_EQ(plists.last, PlistDictionary::make({{"Timestamp", "2024-03-05 14:07:09 +0000"},
                                                {"Data", PlistArray::make({entry("first")})},
                                                {"Description", "in the lift"}}));
  EXPECT_EQ(shell.closings, 0);
  queue.runPosted();
  EXPECT_EQ(shell.closings, 1);
  EXPECT_THAT(ui.alerts, IsEmpty());
  EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(KelvasiSaveViewControllerTest, ASaveSaysWhereTheFileIsAndKeepsNoDescription) {
  open(PlistArray::make({}));
  field().typed = "at the bench";
  interface().use("savePressed");
  EXPECT_THAT(ui.notices, ElementsAre(Pair("Snapshot saved", "/logs/KelvasiSnapshot-1709647629.kelvasi")));
  EXPECT_THAT(shell.kept, ElementsAre(""));
}

TEST_F(KelvasiSaveViewControllerTest, AFailedSaveKeepsTheDescriptionAndGivesNoNotice) {
  open(PlistArray::make({}));
  field().typed = "at the bench";
  files.isFull = true;
  interface().use("savePressed");
  EXPECT_THAT(ui.notices, IsEmpty());
  EXPECT_THAT(shell.kept, ElementsAre("at the bench"));
}

TEST_F(KelvasiSaveViewControllerTest, TheTimestampIsOfTheViewTheNameOfThePress) {
  open(PlistArray::make());
  surroundings.clock.time.secondsSince1970 += 61.9;
  interface().use("savePressed");
  EXPECT_EQ(plists.last.dictionary()->get("Timestamp"), "2024-03-05 14:07:09 +0000");
  EXPECT_TRUE(files.written.contains("/logs/KelvasiSnapshot-1709647690.kelvasi"));
}

TEST_F(KelvasiSaveViewControllerTest, AnEmptyDescriptionIsSavedAsSuch) {
  open(PlistArray::make());
  interface().use("savePressed");
  EXPECT_EQ(plists.last.dictionary()->get("Description"), "");
}

TEST_F(KelvasiSaveViewControllerTest, AFieldWithoutATextSavesNoDescription) {
  open(PlistArray::make());
  field().typed.reset();
  interface().use("savePressed");
  EXPECT_EQ(keysWritten(), "TimestampData");
}

TEST_F(KelvasiSaveViewControllerTest, WithoutSaveContentsOnlyTheTimestampIsSaved) {
  open(PlistValue());
  field().typed = "text";
  interface().use("savePressed");
  EXPECT_EQ(keysWritten(), "Timestamp");
}

TEST_F(KelvasiSaveViewControllerTest, KeepsACopyOfTheListItWasGiven) {
  const auto contents = PlistArray::make({entry("first")});
  open(contents);
  contents->append(entry("later"));
  EXPECT_EQ(interface().table.rows(), 1U);
}

TEST_F(KelvasiSaveViewControllerTest, TwoSavesWithinASecondShareOneFile) {
  open(PlistArray::make());
  interface().use("savePressed");
  surroundings.clock.time.secondsSince1970 += 0.9;
  interface().use("savePressed");
  EXPECT_EQ(files.writes, 2);
  EXPECT_EQ(files.written.size(), 1U);
}

TEST_F(KelvasiSaveViewControllerTest, AWriteThatFailsGivesOneLineOneAlertAndAClosedView) {
  files.isFull = true;
  open(PlistArray::make());
  interface().use("savePressed");
  queue.runPosted();
  EXPECT_THAT(errors(), ElementsAre("Unable to write snapshot to /logs/KelvasiSnapshot-1709647629.kelvasi"));
  EXPECT_THAT(ui.alerts, ElementsAre(test::MemoryUserInterface::Alert{
                             "File Error", "Unable to write file to disk", "Close"}));
  EXPECT_EQ(shell.closings, 1);
}

TEST_F(KelvasiSaveViewControllerTest, TheNextSaveAfterAFailureTriesAnotherName) {
  files.isFull = true;
  open(PlistArray::make());
  interface().use("savePressed");
  files.isFull = false;
  surroundings.clock.time.secondsSince1970 += 1;
  interface().use("savePressed");
  EXPECT_EQ(files.written.size(), 1U);
  EXPECT_TRUE(files.written.contains("/logs/KelvasiSnapshot-1709647630.kelvasi"));
  EXPECT_EQ(ui.alerts.size(), 1U);
}

TEST_F(KelvasiSaveViewControllerTest, ContentsThatCannotBeSerialisedFailTheSameWay) {
  plists.refused = Bytes{'T', 'i', 'm', 'e', 's', 't', 'a', 'm', 'p'};
  open(PlistValue());
  interface().use("savePressed");
  EXPECT_EQ(errors().size(), 1U);
  EXPECT_EQ(ui.alerts.size(), 1U);
  EXPECT_EQ(files.writes, 0);
}

TEST_F(KelvasiSaveViewControllerTest, CancelWritesNothingAndClosesTheViewLater) {
  open(PlistArray::make());
  interface().use("cancelPressed");
  EXPECT_EQ(shell.closings, 0);
  queue.runPosted();
  EXPECT_EQ(shell.closings, 1);
  EXPECT_EQ(files.writes, 0);
}

TEST_F(KelvasiSaveViewControllerTest, ClosingMayDestroyTheViewOfASecondPress) {
  open(PlistArray::make());
  interface().use("savePressed");
  interface().use("savePressed");
  controller.reset();
  queue.runPosted();
  EXPECT_EQ(shell.closings, 2);
}

TEST_F(KelvasiSaveViewControllerTest, TheReturnKeyGivesUpTheKeyboard) {
  open(PlistArray::make());
  EXPECT_TRUE(field().pressReturn());
  EXPECT_FALSE(field().hasKeyboard);
}

TEST_F(KelvasiSaveViewControllerTest, ATouchOfTheBackgroundGivesUpTheKeyboard) {
  open(PlistArray::make());
  interface().use("backgroundTouched");
  EXPECT_FALSE(field().hasKeyboard);
}

TEST_F(KelvasiSaveViewControllerTest, ATouchOfARowGivesUpTheKeyboardAndNothingElse) {
  open(PlistArray::make({entry("first")}));
  interface().table.tap(0);
  EXPECT_FALSE(field().hasKeyboard);
  EXPECT_THAT(interface().table.deselections, IsEmpty());
}

TEST_F(KelvasiSaveViewControllerTest, TheTableAndTheFieldCanBeReplaced) {
  open(PlistArray::make({entry("first")}));
  test::MemoryTable table;
  test::MemoryTextField otherField;
  controller->setSaveContentTable(table);
  controller->setSaveDescription(otherField);
  EXPECT_EQ(&controller->saveContentTable(), &table);
  EXPECT_EQ(&controller->saveDescription(), &otherField);
  EXPECT_EQ(table.rows(), 1U);
  controller.reset();
  EXPECT_FALSE(table.hasSource());
}

TEST_F(KelvasiSaveViewControllerTest, ATableOrFieldThatIsReplacedAsksNoMore) {
  open(PlistArray::make({entry("first")}));
  test::MemoryTable table;
  test::MemoryTextField otherField;
  controller->setSaveContentTable(table);
  controller->setSaveDescription(otherField);
  EXPECT_FALSE(interface().table.hasSource());
  EXPECT_EQ(field().delegate, nullptr);
  controller.reset();
}

TEST_F(KelvasiSaveViewControllerTest, ATableOrFieldThatIsPutInItsOwnPlaceGoesOnAsking) {
  open(PlistArray::make({entry("first")}));
  controller->setSaveContentTable(interface().table);
  controller->setSaveDescription(field());
  EXPECT_TRUE(interface().table.hasSource());
  EXPECT_NE(field().delegate, nullptr);
}

TEST_F(KelvasiSaveViewControllerTest, AFieldThatReplacesOneAfterLoadingAsksItsReturnKeyHere) {
  open(PlistArray::make());
  test::MemoryTextField otherField;
  controller->setSaveDescription(otherField);
  ASSERT_NE(otherField.delegate, nullptr);
  EXPECT_TRUE(otherField.pressReturn());
  EXPECT_FALSE(otherField.hasKeyboard);
  controller.reset();
  EXPECT_EQ(otherField.delegate, nullptr);
}

TEST_F(KelvasiSaveViewControllerTest, AMissingInterfaceResourceIsAnError) {
  ui.resource = "another";
  EXPECT_THROW(open(PlistValue()), std::runtime_error);
}

}  // namespace
}  // namespace kelvasi
