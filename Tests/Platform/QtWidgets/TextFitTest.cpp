// SPDX-License-Identifier: Apache-2.0
// Texts have the room that they need, at whichever scale of the screen the tests are run.
#include <QLabel>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/ElidedLabel.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/FormParts.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowContents;
using test::RowsController;

class TextFitTest : public test::QtFixture {
 protected:
  // Everything in sight.
  void expectRoomForTexts(std::size_t buttons, std::size_t labels) {
    settle();
    std::size_t buttonsSeen = 0;
    std::size_t labelsSeen = 0;
    for (const BarButton* const button : all<BarButton>()) {
      if (!button->isVisible()) continue;
      ++buttonsSeen;
      EXPECT_GE(button->width(), button->sizeHint().width()) << button->text().toStdString();
      EXPECT_GE(button->height(), button->fontMetrics().height()) << button->text().toStdString();
    }
    for (const QLabel* const label : all<QLabel>()) {
      if (!label->isVisible()) continue;
      ++labelsSeen;
      if (!label->wordWrap()) {
        EXPECT_GE(label->width(), widthOf(*label)) << label->text().toStdString();
      }
      const int high = label->wordWrap() ? label->heightForWidth(label->width()) : label->sizeHint().height();
      EXPECT_GE(label->height(), high) << label->text().toStdString();
    }
    EXPECT_EQ(buttonsSeen, buttons);
    EXPECT_EQ(labelsSeen, labels);
  }

  // What a text adds to a picture is as wide and as high as the text, nothing of it cut off or left out.
  static void expectWhole(const QImage& with, const QImage& without, const std::string& text,
                          const Font& font) {
    const double scale = with.devicePixelRatio();
    const QRect drawn = test::differenceOf(with, without);
    const QRectF tight = QFontMetricsF(qtFont(font)).tightBoundingRect(qtText(text));
    EXPECT_NEAR(drawn.width() / scale, tight.width(), 2) << text;
    EXPECT_NEAR(drawn.height() / scale, tight.height(), 2) << text;
  }

 private:
  static double widthOf(const QLabel& label) {
    return QFontMetricsF(label.font()).horizontalAdvance(label.text());
  }
};

TEST_F(TextFitTest, BarsShowTitleWayBackStatusAndSave) {
  showRows(3).setTitle("Kelvasi");
  RowsController& pane = push(3, "Registration");
  const std::string status = "Updated 2024-03-05 at 14:07:09";
  const Font font = Font::system(14);
  stack->setToolbarHidden(false, false);
  pane.setToolbarItems({ActivitySpinner{.isAnimating = false, .hidesWhenStopped = true},
                        ToolbarLabel{.text = status, .font = font, .size = ui->sizeOfText(status, font)},
                        FlexibleSpace{}, SaveButton{[] {}}},
                       true);
  expectRoomForTexts(2, 1);
}

TEST_F(TextFitTest, ATitleIsWhole) {
  RowsController& pane = showRows(3);
  const std::string title = "Gg Serving Cell Measurements";
  auto* const bar = the<NavigationBar>();
  pane.setTitle("");
  settle();
  const QImage without = bar->grab().toImage();
  pane.setTitle(title);
  settle();
  expectWhole(bar->grab().toImage(), without, title, Font::boldSystem(17));
}

TEST_F(TextFitTest, ARowsTextIsWhole) {
  const std::string text = "Ranking Value, Jj";
  const auto picture = [this](const std::string& shown) {
    const RowsController& pane = showRows(1, [shown](std::size_t) { return RowContents{.text = shown}; });
    return tableOf(pane).cellAt(0)->grab().toImage();
  };
  const QImage with = picture(text);
  expectWhole(with, picture(""), text, Font::system(17));
}

TEST_F(TextFitTest, AStatusOrTitleWithoutEnoughRoomEndsInAnEllipsis) {
  for (QLabel* const label : {static_cast<QLabel*>(new ElidedLabel), static_cast<QLabel*>(new FormTitle)}) {
    const std::unique_ptr<QLabel> owned(label);
    const QString text = QStringLiteral("Updated 2024-03-05 at 14:07:09");
    label->setText(text);
    label->resize(100, 30);
    const QString cut = QFontMetricsF(label->font()).elidedText(text, Qt::ElideRight, 100);
    ASSERT_NE(cut, text);
    QLabel wanted(cut);
    wanted.setFont(label->font());
    wanted.resize(100, 30);
    EXPECT_EQ(label->grab().toImage(), wanted.grab().toImage());
    EXPECT_EQ(label->text(), text);
    EXPECT_LT(label->minimumSizeHint().width(), 100);
  }
}

TEST_F(TextFitTest, TheSaveFormShowsItsTexts) {
  showRows(3);
  ViewController form(ui->loadInterface("KelvasiSaveViewController"));
  stack->presentModalViewController(form, false);
  expectRoomForTexts(2, 3);
  stack->dismissModalViewController(false);
}

TEST_F(TextFitTest, AnAlertShowsItsTexts) {
  showRows(3);
  ui->showAlert("File Error", "Unable to write file to disk", "Close");
  expectRoomForTexts(1, 2);
}

}  // namespace
}  // namespace kelvasi
