// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/NavigationStack.h"

#include <iterator>
#include <utility>

namespace kelvasi {

NavigationStack::NavigationStack(std::unique_ptr<ViewController> root) {
  root->setNavigationController(this);
  controllers_.push_back(std::move(root));
}

void NavigationStack::pushViewController(std::unique_ptr<ViewController> controller, bool animated) {
  topViewController().viewWillDisappear(animated);
  controller->setNavigationController(this);
  controllers_.push_back(std::move(controller));
  prepareTop(animated);
  showTop(Change::pushed, animated);
}

void NavigationStack::popToViewController(ViewController& controller, bool animated) {
  if (&controller == &topViewController()) return;
  topViewController().viewWillDisappear(animated);
  Controllers popped;
  while (controllers_.size() > 1 && controllers_.back().get() != &controller) {
    popped.push_back(std::move(controllers_.back()));
    controllers_.pop_back();
  }
  prepareTop(animated);
  showTop(Change::popped, animated);
}

void NavigationStack::popViewController(bool animated) {
  if (controllers_.size() > 1) popToViewController(**std::prev(controllers_.end(), 2), animated);
}

void NavigationStack::presentModalViewController(ViewController& controller, bool animated) {
  if (modal_) return;
  modal_ = &controller;
  controller.loadViewIfNeeded();
  controller.viewWillAppear(animated);
  showModal(controller, animated);
}

void NavigationStack::dismissModalViewController(bool animated) {
  ViewController* const controller = std::exchange(modal_, nullptr);
  if (!controller) return;
  controller->viewWillDisappear(animated);
  hideModal(*controller, animated);
}

void NavigationStack::willAppear() {
  prepareTop(false);
  showTop(Change::none, false);
}

void NavigationStack::prepareTop(bool animated) {
  ViewController& top = topViewController();
  top.loadViewIfNeeded();
  if (delegate_) delegate_->navigationControllerWillShowViewControllerAnimated(*this, top, animated);
  top.viewWillAppear(animated);
}

}  // namespace kelvasi
