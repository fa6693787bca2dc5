// SPDX-License-Identifier: Apache-2.0
// Light and dark, the window and the screen.
#include <QLabel>

#include "Platform/QtWidgets/FormParts.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowsController;

// Of relative luminances, as WCAG 2.1 defines it: 1 to 21.
double contrast(const QColor& one, const QColor& other) {
  const auto luminance = [](const QColor& colour) {
    const auto linear = [](double part) {
      return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) +
           0.0722 * linear(colour.blueF());
  };
  const auto [darker, lighter] = std::minmax({luminance(one), luminance(other)});
  return (lighter + 0.05) / (darker + 0.05);
}

TEST(Palettes, TextsCanBeReadOnEveryGround) {
  for (const ColourScheme scheme : {ColourScheme::light, ColourScheme::dark}) {
    const QPalette palette = paletteOf(scheme);
    for (const auto ground : {QPalette::Base, QPalette::AlternateBase, QPalette::Window, QPalette::Light,
                              QPalette::ToolTipBase}) {
      EXPECT_GE(contrast(palette.color(QPalette::Text), palette.color(ground)), 7) << ground;
      EXPECT_GE(contrast(palette.color(QPalette::PlaceholderText), palette.color(ground)), 4.5) << ground;
      EXPECT_GE(contrast(palette.color(QPalette::Highlight), palette.color(ground)), 4.5) << ground;
    }
  }
}

TEST(Palettes, AChevronCanBeSeenOnARowThatIsPressedOrNot) {
  for (const ColourScheme scheme : {ColourScheme::light, ColourScheme::dark}) {
    const QPalette palette = paletteOf(scheme);
    for (const auto ground : {QPalette::Base, QPalette::AlternateBase})
      EXPECT_GE(contrast(palette.color(QPalette::Dark), palette.color(ground)), 3) << ground;
  }
}

TEST(Palettes, AnAlertStandsOutFromTheRowsThatItDims) {
  for (const ColourScheme scheme : {ColourScheme::light, ColourScheme::dark}) {
    const QPalette palette = paletteOf(scheme);
    const QColor rows = palette.color(QPalette::Base);
    const QColor dimmed = QColor::fromRgbF(rows.redF() * 0.6F, rows.greenF() * 0.6F, rows.blueF() * 0.6F);
    EXPECT_GE(contrast(palette.color(QPalette::ToolTipBase), dimmed), 1.3);
  }
}

class AppearanceTest : public test::QtFixture {
 protected:
  QColor groundOfRows() const { return windowWidget().grab().toImage().pixelColor(200, 700); }
};

TEST_F(AppearanceTest, AnAlertsTextsCanBeReadOnItsGround) {
  for (const ColourScheme scheme : {ColourScheme::light, ColourScheme::dark}) {
    ui = std::make_unique<QtUserInterface>(
        QtUserInterface::Options{.colourScheme = scheme, .animates = false});
    showRows(1);
    ui->showAlert("File Error", "Unable to write file to disk", "Close");
    const QColor ground = the<Card>()->palette().color(the<Card>()->backgroundRole());
    for (const QLabel* const text : the<Card>()->findChildren<QLabel*>())
      EXPECT_GE(contrast(text->palette().color(text->foregroundRole()), ground), 7);
    window.reset();
    stack.reset();
  }
}

TEST_F(AppearanceTest, AnAlertFitsTheSmallestWindow) {
  showRows(1);
  windowWidget().resize(240, 320);
  ui->showAlert("No display templates",
                "They were looked for in /usr/local/share/kelvasi/resources/templates.", "Close");
  settle();
  const auto* const card = the<Card>();
  EXPECT_TRUE(windowWidget().rect().contains(card->geometry()));
  for (const QLabel* const text : card->findChildren<QLabel*>()) {
    EXPECT_TRUE(card->rect().contains(text->geometry())) << text->text().toStdString();
    EXPECT_GE(text->height(), text->heightForWidth(text->width()));
  }
}

TEST_F(AppearanceTest, AnEmptyPaneSaysThatNothingCame) {
  RowsController& pane = showRows(0);
  EXPECT_EQ(tableOf(pane).emptyText(), "Nothing received yet");
  const QImage empty = windowWidget().grab().toImage();
  pane.rows = 1;
  pane.tableView().reloadData();
  settle();
  EXPECT_EQ(tableOf(pane).emptyText(), "");
  const QRect middle(60, 200, 270, 500);
  EXPECT_FALSE(test::differenceOf(empty.copy(middle), windowWidget().grab().toImage().copy(middle)).isNull());
}

TEST_F(AppearanceTest, InAWideWindowAValueStaysNearItsName) {
  const RowsController& pane = showRows(1);
  windowWidget().resize(800, 700);
  settle();
  EXPECT_EQ(tableOf(pane).cellAt(0)->contentView().bounds().width, 600 - 10);
  const QImage with = tableOf(pane).cellAt(0)->grab().toImage();
  EXPECT_EQ(with.pixelColor(40, 49), paletteOf(ColourScheme::light).color(QPalette::Base));
  EXPECT_EQ(with.pixelColor(400, 49), paletteOf(ColourScheme::light).color(QPalette::Mid));
}

TEST_F(AppearanceTest, AStatedSchemeIsPainted) {
  for (const ColourScheme scheme : {ColourScheme::light, ColourScheme::dark}) {
    ui = std::make_unique<QtUserInterface>(
        QtUserInterface::Options{.colourScheme = scheme, .animates = false});
    showRows(1);
    EXPECT_EQ(groundOfRows(), paletteOf(scheme).color(QPalette::Base));
    window.reset();
    stack.reset();
  }
}

TEST_F(AppearanceTest, WithoutAPortalItFollowsTheApplicationsPalette) {
  qunsetenv("DBUS_SESSION_BUS_ADDRESS");
  qputenv("XDG_RUNTIME_DIR", "/nowhere");
  QApplication::setPalette(paletteOf(ColourScheme::light));
  ui = std::make_unique<QtUserInterface>(QtUserInterface::Options{.animates = false});
  showRows(1);
  EXPECT_EQ(groundOfRows(), paletteOf(ColourScheme::light).color(QPalette::Base));
  QApplication::setPalette(paletteOf(ColourScheme::dark));
  settle();
  EXPECT_EQ(groundOfRows(), paletteOf(ColourScheme::dark).color(QPalette::Base));
  QApplication::setPalette(paletteOf(ColourScheme::light));
}

TEST_F(AppearanceTest, OnADesktopTheWindowIsAPhonesAndTheSaveViewMayTakeAllOfIt) {
  // The offscreen display is 800 by 800 points: the window leaves room for its title bar there.
  EXPECT_EQ(ui->mainScreen().bounds(), (Rect{0, 0, 390, 752}));
  EXPECT_EQ(ui->mainScreen().applicationFrame(), ui->mainScreen().bounds());
}

TEST_F(AppearanceTest, FullScreenTakesTheWholeScreen) {
  ui = std::make_unique<QtUserInterface>(QtUserInterface::Options{.fullScreen = true, .animates = false});
  EXPECT_EQ(ui->mainScreen().bounds(), (Rect{0, 0, 800, 800}));
}

TEST_F(AppearanceTest, AWindowThatGoesLeavesItsSubviewsUnseen) {
  showRows(3);
  QWidget& view = widgetOf(stack->view());
  window->orderOut();
  EXPECT_FALSE(view.isVisible());
  window.reset();
  EXPECT_EQ(view.parentWidget(), nullptr);
  EXPECT_FALSE(view.isVisible());
}

}  // namespace
}  // namespace kelvasi
