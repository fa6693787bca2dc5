// SPDX-License-Identifier: Apache-2.0
// What a screen reader is told.
#include <QAccessible>
#include <QLabel>

#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/Spinner.h"
#include "Platform/QtWidgets/Toolbar.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowContents;
using test::RowsController;
using testing::ElementsAre;

class AccessibilityTest : public test::QtFixture {
 protected:
  static QAccessibleInterface& of(QObject* object) { return *QAccessible::queryAccessibleInterface(object); }
  static QString nameOf(QObject* object) { return of(object).text(QAccessible::Name); }
};

TEST_F(AccessibilityTest, ATableIsAListOfTheRowsInSight) {
  const RowsController& pane = showRows(1000);
  QAccessibleInterface& table = of(&tableOf(pane));
  EXPECT_EQ(table.role(), QAccessible::List);
  ASSERT_EQ(table.childCount(), static_cast<int>(tableOf(pane).cellsInSight().size()));
  EXPECT_EQ(table.child(3)->text(QAccessible::Name), "Row 3");
  EXPECT_EQ(table.indexOfChild(table.child(3)), 3);
  EXPECT_EQ(table.child(-1), nullptr);
  EXPECT_EQ(table.child(table.childCount()), nullptr);
}

TEST_F(AccessibilityTest, ARowIsAnItemThatCanBePressed) {
  const RowsController& pane = showRows(3);
  QAccessibleInterface& row = of(tableOf(pane).cellAt(1));
  EXPECT_EQ(row.role(), QAccessible::ListItem);
  EXPECT_EQ(row.parent(), &of(&tableOf(pane)));
  ASSERT_NE(row.actionInterface(), nullptr);
  row.actionInterface()->doAction(QAccessibleActionInterface::pressAction());
  EXPECT_THAT(pane.opened, ElementsAre(1));
}

TEST_F(AccessibilityTest, ACheckedRowAndTheRowOfTheKeyboardSaySo) {
  const RowsController& pane = showRows(2, [](std::size_t row) {
    return RowContents{.text = {}, .accessory = row == 0 ? CellAccessory::checkmark : CellAccessory::none};
  });
  key(Qt::Key_End);
  const QAccessible::State first = of(tableOf(pane).cellAt(0)).state();
  const QAccessible::State second = of(tableOf(pane).cellAt(1)).state();
  EXPECT_TRUE(first.checked);
  EXPECT_FALSE(first.focused);
  EXPECT_FALSE(second.checked);
  EXPECT_TRUE(second.focused);
}

TEST_F(AccessibilityTest, ARowThatOpensSaysSoAndALeafDoesNot) {
  const RowsController& pane = showRows(2, [](std::size_t row) {
    return RowContents{.text = "Name",
                       .accessory = row == 0 ? CellAccessory::disclosureIndicator : CellAccessory::none};
  });
  EXPECT_EQ(of(tableOf(pane).cellAt(0)).text(QAccessible::Description), "Opens");
  EXPECT_EQ(of(tableOf(pane).cellAt(1)).text(QAccessible::Description), "");
  EXPECT_EQ(nameOf(tableOf(pane).cellAt(0)), nameOf(tableOf(pane).cellAt(1)));
}

TEST_F(AccessibilityTest, BarsNameTheirTitleAndButtons) {
  RowsController& root = showRows(1);
  root.setToolbarItems({ActivitySpinner{.isAnimating = true}, SaveButton{[] {}}}, true);
  push(1, "Next");
  EXPECT_EQ(of(the<NavigationBar>()).role(), QAccessible::ToolBar);
  EXPECT_EQ(nameOf(the<NavigationBar>()), "Next");
  EXPECT_EQ(of(the<BarButton>()).role(), QAccessible::Button);
  EXPECT_EQ(nameOf(the<BarButton>()), "Back to Root");
  stack->popViewController(false);
  EXPECT_EQ(nameOf(the<Toolbar>()->saveButton()), "Save");
  EXPECT_EQ(of(the<Spinner>()).role(), QAccessible::Animation);
  EXPECT_EQ(nameOf(the<Spinner>()), "Busy");
}

TEST_F(AccessibilityTest, TheSelectedRowSaysSo) {
  const RowsController& pane = showRows(2);
  tableOf(pane).open(1);
  EXPECT_FALSE(of(tableOf(pane).cellAt(0)).state().selected);
  EXPECT_TRUE(of(tableOf(pane).cellAt(1)).state().selected);
}

TEST_F(AccessibilityTest, TheSaveViewIsAModalDialogWithAName) {
  showRows(1);
  ViewController form(ui->loadInterface("KelvasiSaveViewController"));
  stack->presentModalViewController(form, false);
  QAccessibleInterface& dialog = of(the<ModalLayer>());
  EXPECT_EQ(dialog.role(), QAccessible::Dialog);
  EXPECT_TRUE(dialog.state().modal);
  EXPECT_EQ(nameOf(the<ModalLayer>()), "Save Snapshot");
  stack->dismissModalViewController(false);
}

TEST_F(AccessibilityTest, AnEmptyPaneSaysSoToAReaderToo) {
  const RowsController& pane = showRows(0);
  EXPECT_EQ(of(&tableOf(pane)).text(QAccessible::Description), "Nothing received yet");
}

TEST_F(AccessibilityTest, AnAlertIsOne) {
  showRows(1);
  ui->showAlert("File Error", "Unable to write file to disk", "Close");
  EXPECT_EQ(of(the<AlertLayer>()).role(), QAccessible::AlertMessage);
  EXPECT_EQ(nameOf(the<AlertLayer>()), "File Error");
}

TEST_F(AccessibilityTest, TheSaveViewsPartsHaveNames) {
  showRows(1);
  const auto interface = ui->loadInterface("KelvasiSaveViewController");
  EXPECT_EQ(nameOf(&widgetOf(*interface->tableView("saveContentTable"))), "Contents");
  EXPECT_EQ(nameOf(&widgetOf(*interface->textField("saveDescription"))), "Description");
}

}  // namespace
}  // namespace kelvasi
