// SPDX-License-Identifier: Apache-2.0
// The cockpit's pages, one upon the other, with a bar: over the whole window, or beside the panes.
#pragma once

#include <QWidget>
#include <functional>
#include <vector>

#include "Tools/Kelvasi/Cockpit/CockpitPage.h"

namespace kelvasi {

class NavigationBar;

class CockpitPane : public QWidget {
 public:
  // `leave`: what the way back from the first page does; empty where there is none.
  explicit CockpitPane(std::function<void()> leave);

  void setRoot(CockpitPage* page);
  // Takes the page, which is shown.
  void push(CockpitPage* page);
  // Shows the page below, or leaves.
  void goBack();
  void goToRoot();
  CockpitPage& top() const { return *pages_.back(); }
  std::size_t depth() const { return pages_.size(); }
  void refresh();
  // Whether it covers the window, and so has a way out of its first page.
  void setCovering(bool covers);
  bool isCovering() const { return covers_; }
  // Whether pages slide; they do unless the desktop asks for less.
  void setAnimated(bool isAnimated) { isAnimated_ = isAnimated; }

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void showPage(CockpitPage& page);
  void changePage(bool isPush, const std::function<void()>& change);
  void dropPage();
  void placePage();

  std::function<void()> leave_;
  bool covers_ = false;
  bool isAnimated_ = true;
  NavigationBar* bar_;  // a child
  std::vector<CockpitPage*> pages_;
};

}  // namespace kelvasi
