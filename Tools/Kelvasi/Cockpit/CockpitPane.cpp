// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CockpitPane.h"

#include <QKeyEvent>
#include <chrono>

#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/SlideOverlay.h"

namespace kelvasi {

namespace {
constexpr std::chrono::milliseconds motionTime{180};
}

CockpitPane::CockpitPane(std::function<void()> leave)
    : leave_(std::move(leave)), bar_(new NavigationBar(this, [this] { goBack(); })) {
  setAttribute(Qt::WA_DeleteOnClose);  // goes with the window
  setAutoFillBackground(true);
  setBackgroundRole(QPalette::Base);
}

void CockpitPane::setRoot(CockpitPage* page) {
  pages_ = {page};
  page->setParent(this);
  showPage(*page);
}

void CockpitPane::push(CockpitPage* page) {
  page->setParent(this);
  changePage(true, [&] {
    pages_.back()->hide();
    pages_.push_back(page);
    showPage(*page);
  });
  page->firstFocus().setFocus();
}

// A page slides over the one that leads to it.
void CockpitPane::changePage(bool isPush, const std::function<void()>& change) {
  const bool isSeen = isAnimated_ && isVisible();
  const QPixmap before = isSeen ? grab() : QPixmap();
  change();
  if (!isSeen) return;
  const auto direction = isPush ? SlideOverlay::Direction::leftwards : SlideOverlay::Direction::rightwards;
  new SlideOverlay(*this, rect(), {before, grab()}, direction, bar_->height(), motionTime);
}

void CockpitPane::goBack() {
  if (pages_.size() < 2) {
    if (covers_) leave_();
    return;
  }
  changePage(false, [this] { dropPage(); });
}

void CockpitPane::dropPage() {
  CockpitPage* const gone = pages_.back();
  pages_.pop_back();
  showPage(top());
  top().firstFocus().setFocus();
  gone->hide();
  gone->deleteLater();
}

void CockpitPane::goToRoot() {
  while (pages_.size() > 1) dropPage();
}

void CockpitPane::showPage(CockpitPage& page) {
  const auto title = [](const CockpitPage* shown) { return shown->title(); };
  const bool isFirst = pages_.size() == 1;
  const std::optional<QString> back = !isFirst  ? std::optional(title(pages_[pages_.size() - 2]))
                                      : covers_ ? std::optional(tr("Panes"))
                                                : std::nullopt;
  bar_->show(page.title(), back);
  placePage();
  page.show();
  page.refresh();
}

void CockpitPane::setCovering(bool covers) {
  covers_ = covers;
  showPage(top());
}

void CockpitPane::refresh() {
  if (isVisible()) top().refresh();
}

void CockpitPane::placePage() {
  bar_->setGeometry(0, 0, width(), bar_->height());
  if (!pages_.empty()) top().setGeometry(0, bar_->height(), width(), height() - bar_->height());
}

void CockpitPane::resizeEvent(QResizeEvent*) {
  placePage();
}

void CockpitPane::keyPressEvent(QKeyEvent* event) {
  const int key = event->key();
  const bool isBack = key == Qt::Key_Escape || key == Qt::Key_Backspace || key == Qt::Key_Back ||
                      (key == Qt::Key_Left && event->modifiers().testFlag(Qt::AltModifier));
  if (isBack && (covers_ || pages_.size() > 1)) return goBack();
  if (!top().takeKey(*event)) event->ignore();
}

}  // namespace kelvasi
