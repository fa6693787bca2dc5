// SPDX-License-Identifier: Apache-2.0
// A navigation bar, a page and a toolbar above each other.
#pragma once

#include <QPointer>
#include <QWidget>
#include <functional>

namespace kelvasi {

class NavigationBar;
class Toolbar;

class StackWidget : public QWidget {
 public:
  // Escape, Backspace, Alt+Left and a mouse's back button go back as the bar's button does; Ctrl+S is the
  // toolbar's Save button.
  explicit StackWidget(std::function<void()> goBack);

  NavigationBar& bar() const { return *bar_; }
  Toolbar& toolbar() const { return *toolbar_; }
  void goBack() { goBack_(); }
  // Shows `page` instead of the one before, which is hidden. Does not own it.
  void showPage(QWidget& page);
  // Shown below the rows of the root page while these leave it the room it needs at least; null for none.
  void setFoot(QWidget* foot);
  // To be called when the page or its rows are others.
  void updateFoot() { placePage(); }
  // Where bar and page are.
  QRect slidingArea() const;

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  bool event(QEvent* event) override;
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void placePage();
  int heightOfFoot() const;

  std::function<void()> goBack_;
  NavigationBar* bar_;  // children
  QWidget* content_;
  Toolbar* toolbar_;
  QPointer<QWidget> page_;
  QPointer<QWidget> foot_;
};

}  // namespace kelvasi
