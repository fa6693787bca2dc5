// SPDX-License-Identifier: Apache-2.0
// The toolkit without a display, and controllers with rows of text to show in it.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <QApplication>
#include <QTest>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/QtUserInterface.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/WidgetView.h"

namespace kelvasi::test {

// The rectangle around the pixels in which two pictures differ; null when they are the same.
inline QRect differenceOf(const QImage& one, const QImage& other) {
  QRect difference;
  for (int y = 0; y < one.height(); ++y) {
    for (int x = 0; x < one.width(); ++x) {
      if (one.pixel(x, y) != other.pixel(x, y)) difference |= QRect(x, y, 1, 1);
    }
  }
  return difference;
}

// Names what a row is given to show.
struct RowContents {
  std::string text;
  CellAccessory accessory = CellAccessory::none;
  double wideContent = 0;  // points; 0 for nothing that scrolls
};

// A row with a view that may scroll, as panes have, and its text in it.
class TestCell : public TableViewCell {
 public:
  TestCell(UserInterface& ui, TableView& table)
      : TableViewCell(table.makeCellBody(CellStyle::twoLabelValue), "row"),
        view_(ui.makeScrollView()),
        label_(ui.makeLabel()) {
    view_->addSubview(*label_);
    body().contentView().addSubview(*view_);
  }
  void show(const RowContents& contents) {
    body().setAccessory(contents.accessory);
    body().layOutStandard();
    const Rect area = body().contentView().bounds();
    label_->setText(contents.text);
    label_->setFrame({10, 0, 200, area.height});
    view_->setFrame(area);
    view_->setContentSize({std::max(area.width, contents.wideContent), area.height});
  }

 private:
  std::unique_ptr<ScrollView> view_;
  std::unique_ptr<Label> label_;
};

class RowsController : public TableViewController {
 public:
  RowsController(UserInterface& ui, std::size_t itsRows, const std::string& itsTitle)
      : TableViewController(ui.makeTableControllerBody()), rows(itsRows), ui_(ui) {
    setTitle(itsTitle);
  }
  ~RowsController() override {
    if (gone) gone();
  }

  std::size_t tableViewNumberOfRowsInSection(TableView&, std::size_t) override { return rows; }
  std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& table,
                                                                const IndexPath& indexPath) override {
    auto reused = table.dequeueReusableCellWithIdentifier("row");
    std::unique_ptr<TestCell> cell(static_cast<TestCell*>(reused.release()));
    if (!cell) {
      cell = std::make_unique<TestCell>(ui_, table);
      ++cellsMade;
    }
    cell->show(contentsOf(indexPath.row));
    return cell;
  }
  void tableViewDidSelectRowAtIndexPath(TableView&, const std::optional<IndexPath>& indexPath) override {
    opened.push_back(indexPath->row);
  }

  std::size_t rows;
  std::function<RowContents(std::size_t row)> contentsOf = [](std::size_t row) {
    return RowContents{.text = "Row " + std::to_string(row)};
  };
  std::size_t cellsMade = 0;
  std::vector<std::size_t> opened;
  std::function<void()> gone;

 private:
  UserInterface& ui_;
};

// A window of 390 by 844 points on a bright desktop.
class QtFixture : public testing::Test {
 protected:
  RowsController& showRows(std::size_t rows, std::function<RowContents(std::size_t)> contentsOf = {}) {
    auto made = std::make_unique<RowsController>(*ui, rows, "Root");
    if (contentsOf) made->contentsOf = std::move(contentsOf);
    RowsController& controller = *made;
    showRoot(std::move(made));
    return controller;
  }
  void showRoot(std::unique_ptr<ViewController> root) {
    stack = ui->makeNavigationStack(std::move(root));
    openWindow();
  }
  RowsController& push(std::size_t rows, const std::string& title, bool animated = true) {
    auto made = std::make_unique<RowsController>(*ui, rows, title);
    RowsController& controller = *made;
    stack->pushViewController(std::move(made), animated);
    settle();
    return controller;
  }
  void animate() {
    ui = std::make_unique<QtUserInterface>(QtUserInterface::Options{.colourScheme = ColourScheme::light});
  }

  static TableWidget& tableOf(const TableViewController& controller) {
    return dynamic_cast<TableWidget&>(controller.tableView());
  }
  QWidget& windowWidget() const { return widgetOf(*window); }
  template <typename Widget>
  std::vector<Widget*> all() const {
    std::vector<Widget*> found;
    for (QWidget* const child : windowWidget().findChildren<QWidget*>()) {
      if (auto* const widget = dynamic_cast<Widget*>(child)) found.push_back(widget);
    }
    return found;
  }
  template <typename Widget>
  Widget* the() const {
    const auto found = all<Widget>();
    return found.empty() ? nullptr : found.front();
  }
  // To whichever widget has the keyboard, shortcuts included.
  static void key(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
    QTest::keyClick(QApplication::focusWidget(), key, modifiers);
  }
  // One of those that come while a key is held.
  static void repeatKey(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
                        const QString& text = {}) {
    QTest::simulateEvent(QApplication::focusWidget(), true, key, modifiers, text, true);
  }
  // Layouts, paint events and late deletions.
  static void settle() {
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
  }

  std::unique_ptr<QtUserInterface> ui = std::make_unique<QtUserInterface>(
      QtUserInterface::Options{.colourScheme = ColourScheme::light, .animates = false});
  std::unique_ptr<NavigationStack> stack;
  std::unique_ptr<Window> window;

 private:
  void openWindow() {
    window = ui->makeWindow({0, 0, 390, 844});
    window->setRootViewController(*stack);
    window->addSubview(stack->view());
    window->makeKeyAndVisible();
    settle();
    ASSERT_NE(QApplication::focusWidget(), nullptr);
  }
};

}  // namespace kelvasi::test
