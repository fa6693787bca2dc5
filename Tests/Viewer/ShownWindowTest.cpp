// SPDX-License-Identifier: Apache-2.0
// A script's hands on a window that is not the active one.
#include "Tools/Kelvasi/ShownWindow.h"

#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowContents;
using test::RowsController;
using testing::ElementsAre;

class ShownWindowTest : public test::QtFixture {
 protected:
  // As when the user works elsewhere, or where there is no keyboard at all.
  void loseTheKeyboard() {
    other_.show();
    other_.activateWindow();
    settle();
    ASSERT_FALSE(windowWidget().isActiveWindow());
  }

 private:
  QWidget other_;
};

TEST_F(ShownWindowTest, ARowIsFoundAndOpened) {
  const RowsController& pane = showRows(20);
  loseTheKeyboard();
  EXPECT_TRUE(goToRow("Row 13"));
  openRow();
  EXPECT_THAT(pane.opened, ElementsAre(13));
}

TEST_F(ShownWindowTest, ARowThatIsNotThereIsNotFound) {
  showRows(20);
  loseTheKeyboard();
  EXPECT_FALSE(goToRow("Row 20"));
}

TEST_F(ShownWindowTest, AWideValueIsScrolled) {
  const RowsController& pane = showRows(
      3, [](std::size_t row) { return RowContents{.text = "wide", .wideContent = row == 0 ? 1000.0 : 0}; });
  loseTheKeyboard();
  ASSERT_TRUE(showsWideValue());
  scrollWideValue();
  EXPECT_GT(tableOf(pane).cellAt(0)->scrollView()->offset(), 0);
}

}  // namespace
}  // namespace kelvasi
