// SPDX-License-Identifier: Apache-2.0
// A pane's rows as they are drawn: the geometry of the application in the toolkit's window.
#include <QFontMetricsF>

#include "App/KelvasiPaneController.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/PaintedViews.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"
#include "Tests/Support/PaneParts.h"

namespace kelvasi {
namespace {

using test::branch;
using test::leaf;

constexpr double contentWidth = 380;  // of a row of values in a window of 390 points

class PaneOnScreenTest : public test::QtFixture {
 protected:
  void showRow(NodeRef row) {
    auto made = std::make_unique<KelvasiPaneController>(*ui, shell, branch("Pane", {std::move(row)}), "/");
    pane = made.get();
    showRoot(std::move(made));
  }
  CellWidget& cell() const { return *tableOf(*pane).cellAt(0); }
  QImage picture() const { return cell().grab().toImage(); }
  // What the text of a value draws.
  QRect drawnValue(const char* key, const char* value) {
    showRow(leaf(key, ""));
    const QImage without = picture();
    showRow(leaf(key, value));
    return test::differenceOf(picture(), without);
  }
  static double widthOf(const char* text) { return sizeOfText(text, Font::boldSystem(15)).width; }

  test::FakeShell shell;
  KelvasiPaneController* pane = nullptr;
};

// The regular text fills the room that was measured for the bold one.
TEST_F(PaneOnScreenTest, AShortValueTakesItsPlaceUpToTheContentsRightEdge) {
  for (const char* const text : {"HHHH", "MM_IDLE", "-111 dBm", "H"}) {
    const QRect value = drawnValue("Cell", text);
    EXPECT_NEAR(value.left(), contentWidth - widthOf(text) + 1, 1.5) << text;
    EXPECT_NEAR(value.right(), contentWidth - 2, 1.5) << text;
  }
  EXPECT_EQ(cell().scrollView()->furthestOffset(), 0);
}

TEST_F(PaneOnScreenTest, ValuesOfAsManyDigitsEndAtOneEdgeAndBeginAtOne) {
  for (const char* const text : {"111 H", "888 H", "417 H", "290 H"}) {
    const QRect ones = drawnValue("Cell", "000 H");
    const QRect value = drawnValue("Cell", text);
    EXPECT_EQ(value.right(), ones.right()) << text;
    EXPECT_NEAR(value.left(), ones.left(), 2) << text;  // a digit is narrower than its room
  }
}

TEST_F(PaneOnScreenTest, AKeyBeginsTenPointsFromTheLeft) {
  showRow(leaf("", ""));
  const QImage without = picture();
  showRow(leaf("HHHH", ""));
  const QRectF ink = QFontMetricsF(qtFont(Font::boldSystem(15))).tightBoundingRect(QStringLiteral("HHHH"));
  EXPECT_NEAR(test::differenceOf(picture(), without).left(), 10 + ink.left(), 1);
}

TEST_F(PaneOnScreenTest, ALongValueBeginsFiftyPointsAfterItsKeyAndScrolls) {
  const char* const key = "Cell";
  const char* const value = "HHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHH";
  const QRect drawn = drawnValue(key, value);
  EXPECT_NEAR(drawn.left(), 10 + widthOf(key) + 50 + 1, 2);
  EXPECT_LE(drawn.right(), contentWidth);
  EXPECT_EQ(cell().scrollView()->furthestOffset(), widthOf(key) + widthOf(value));
}

TEST_F(PaneOnScreenTest, ABranchOpensAndItsRowDoesNotScroll) {
  showRow(branch("Cell"));
  EXPECT_EQ(cell().scrollView(), nullptr);
  EXPECT_EQ(cell().contentView().bounds().width, 390 - 34);
}

}  // namespace
}  // namespace kelvasi
