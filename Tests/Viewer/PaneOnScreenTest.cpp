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

// Of the room that the bold text would take the regular one leaves some at the right.
TEST_F(PaneOnScreenTest, AShortValueHasItsPlaceAtTheContentsRightEdge) {
  const QRect value = drawnValue("Cell", "HHHH");
  const double left = contentWidth - widthOf("HHHH");
  const QRectF ink = QFontMetricsF(qtFont(Font::system(15))).tightBoundingRect(QStringLiteral("HHHH"));
  EXPECT_NEAR(value.left(), left + ink.left(), 1);
  EXPECT_NEAR(value.width(), ink.width(), 2);
  EXPECT_EQ(cell().scrollView()->furthestOffset(), 0);
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
