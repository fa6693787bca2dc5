// SPDX-License-Identifier: Apache-2.0
// The keys of the window, and notices in it.
#include "Platform/QtWidgets/TopWidget.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QLabel>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/FileNotice.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

class TopWidgetTest : public test::QtFixture {};

TEST_F(TopWidgetTest, F11FillsTheScreenAndGivesItBack) {
  showRows(3);
  key(Qt::Key_F11);
  settle();
  EXPECT_TRUE(windowWidget().isFullScreen());
  EXPECT_EQ(ui->window()->windowedSize(), QSize(390, 844));
  key(Qt::Key_F11);
  settle();
  EXPECT_FALSE(windowWidget().isFullScreen());
  EXPECT_EQ(windowWidget().size(), QSize(390, 844));
}

TEST_F(TopWidgetTest, WhatIsMinimizedComesToTheFrontAsItWas) {
  showRows(3);
  windowWidget().showMinimized();
  settle();
  ASSERT_TRUE(windowWidget().isMinimized());
  ui->window()->bringToFront();
  settle();
  EXPECT_FALSE(windowWidget().isMinimized());
  EXPECT_TRUE(windowWidget().isActiveWindow());
  EXPECT_EQ(windowWidget().size(), QSize(390, 844));
}

TEST_F(TopWidgetTest, ControlWClosesFromAnywhere) {
  showRows(3);
  push(2, "Next");
  key(Qt::Key_W, Qt::ControlModifier);
  EXPECT_FALSE(windowWidget().isVisible());
}

TEST_F(TopWidgetTest, ControlQClosesEveryWindow) {
  showRows(3);
  key(Qt::Key_Q, Qt::ControlModifier);
  EXPECT_FALSE(windowWidget().isVisible());
}

TEST_F(TopWidgetTest, ANoticeFitsTheSmallestWindowAndCopiesThePath) {
  showRows(3);
  windowWidget().resize(240, 320);
  const std::string path = "/home/somebody/.local/state/kelvasi/KelvasiSnapshot-1709647629.kelvasi";
  ui->showFileNotice("Snapshot saved", path);
  ui->showFileNotice("Snapshot saved", path);  // in the place of the first
  settle();
  ASSERT_EQ(all<FileNotice>().size(), 1U);
  const auto* const notice = the<FileNotice>();
  EXPECT_TRUE(windowWidget().rect().contains(notice->geometry()));
  for (const QLabel* const text : notice->findChildren<QLabel*>())
    EXPECT_GE(text->height(), text->heightForWidth(text->width())) << text->text().toStdString();
  notice->findChild<QPushButton*>()->click();
  EXPECT_EQ(QGuiApplication::clipboard()->text().toStdString(), path);
  settle();
  EXPECT_EQ(the<FileNotice>(), nullptr);
}

}  // namespace
}  // namespace kelvasi
