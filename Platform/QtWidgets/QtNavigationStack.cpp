// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/QtNavigationStack.h"

#include <algorithm>

#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/Page.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Platform/QtWidgets/StackWidget.h"
#include "Platform/QtWidgets/Toolbar.h"

namespace kelvasi {

namespace {

Page& pageOf(const ViewController& controller) {
  return dynamic_cast<Page&>(controller.body());
}

// Alerts stay above everything that comes later.
void raiseAlerts(const QWidget& window) {
  for (QObject* const child : window.children()) {
    if (auto* const alert = dynamic_cast<AlertLayer*>(child)) alert->raise();
  }
}

// Whether a view or an alert lies over the panes; it then has the keyboard.
bool isCovered(const QWidget& window) {
  return std::ranges::any_of(window.children(), [](QObject* child) {
    const auto* const layer = dynamic_cast<Layer*>(child);
    return layer && !layer->isHidden();
  });
}

}  // namespace

QtNavigationStack::QtNavigationStack(std::unique_ptr<ViewController> root, bool animates)
    : NavigationStack(std::move(root)),
      animates_(animates),
      widget_(std::make_unique<StackWidget>([this] { popViewController(true); })),
      view_(*widget_) {
  widget_->toolbar().hide();
}

// The pages belong to their controllers, which go later than the widgets around them.
QtNavigationStack::~QtNavigationStack() {
  for (const auto& controller : viewControllers()) {
    Page& page = pageOf(*controller);
    page.setChanged(nullptr);
    page.widget().setParent(nullptr);
  }
}

void QtNavigationStack::setToolbarHidden(bool hidden, bool) {
  widget_->toolbar().setVisible(!hidden);
}

void QtNavigationStack::showTop(Change change, bool animated) {
  const QRect area = widget_->slidingArea();
  if (change == Change::none || !animated || !animates_ || !widget_->isVisible()) return swapPage(change);
  SlideOverlay::Pictures pictures;
  pictures.before = widget_->grab(area);
  swapPage(change);
  pictures.after = widget_->grab(area);
  const auto direction =
      change == Change::pushed ? SlideOverlay::Direction::leftwards : SlideOverlay::Direction::rightwards;
  new SlideOverlay(*widget_, area, std::move(pictures), direction, widget_->bar().height());
}

// A pane that was opened by keyboard goes on with it, as if it were reached with Tab.
void QtNavigationStack::swapPage(Change change) {
  const bool isByKeyboard = change == Change::pushed && shown_ && shown_->isKeyboardInUse();
  Page& page = pageOf(topViewController());
  shown_ = &page;
  page.setChanged([this, &page] {
    if (shown_ == &page) showBars();
  });
  widget_->showPage(page.widget());
  showBars();
  if (!isCovered(*widget_->window()))
    page.firstFocus().setFocus(isByKeyboard ? Qt::TabFocusReason : Qt::OtherFocusReason);
}

void QtNavigationStack::showBars() {
  widget_->bar().show(shown_->title(), backTitle());
  widget_->updateFoot();
  widget_->toolbar().setItems(shown_->toolbarItems());
}

std::optional<QString> QtNavigationStack::backTitle() const {
  const auto& controllers = viewControllers();
  if (controllers.size() < 2) return std::nullopt;
  return pageOf(*controllers[controllers.size() - 2]).title();
}

void QtNavigationStack::showModal(ViewController& controller, bool animated) {
  modalLayer_ = std::make_unique<ModalLayer>(*widget_->window(), pageOf(controller), animated && animates_);
  raiseAlerts(*widget_->window());
}

void QtNavigationStack::hideModal(ViewController& controller, bool animated) {
  QWidget& window = *widget_->window();
  SlideOverlay::Pictures pictures;
  if (animated && animates_) pictures.before = pageOf(controller).widget().grab();
  modalLayer_.reset();
  if (!pictures.before.isNull())
    new SlideOverlay(window, window.rect(), std::move(pictures), SlideOverlay::Direction::downwards);
  raiseAlerts(window);
}

}  // namespace kelvasi
