// SPDX-License-Identifier: Apache-2.0
// The toolkit's half of a controller: a widget, and what the bars around it show.
#pragma once

#include <QWidget>
#include <functional>
#include <memory>
#include <utility>

#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/WidgetView.h"
#include "Platform/UserInterface/ViewController.h"

namespace kelvasi {

class Page {
 public:
  virtual QWidget& widget() = 0;
  // What takes the keyboard when the page is shown.
  virtual QWidget& firstFocus() = 0;
  // Whether a user works on it by keyboard.
  virtual bool isKeyboardInUse() { return false; }

  const QString& title() const { return title_; }
  const ToolbarItems& toolbarItems() const { return items_; }
  // Called after title or items were set.
  void setChanged(std::function<void()> changed) { changed_ = std::move(changed); }

 protected:
  ~Page() = default;
  void takeTitle(std::string_view title) {
    title_ = qtText(title);
    widget().setAccessibleName(title_);
    if (changed_) changed_();
  }
  void takeItems(ToolbarItems items) {
    items_ = std::move(items);
    if (changed_) changed_();
  }

 private:
  QString title_;
  ToolbarItems items_;
  std::function<void()> changed_;
};

// A page of a controller's body; `Interface` says of which kind.
template <typename Interface>
class PageBody : public Interface, public Page {
 public:
  explicit PageBody(std::unique_ptr<QWidget, DeleteLater> itsWidget) : widget_(std::move(itsWidget)) {}

  View& view() override { return view_; }
  void setTitle(std::string_view title) override { takeTitle(title); }
  void setToolbarItems(ToolbarItems items, bool) override { takeItems(std::move(items)); }
  void resignFirstResponder() override {
    if (QWidget* const focused = widget_->focusWidget()) focused->clearFocus();
  }
  QWidget& widget() override { return *widget_; }
  QWidget& firstFocus() override { return *widget_; }

 private:
  std::unique_ptr<QWidget, DeleteLater> widget_;
  WidgetView view_{*widget_};
};

class TablePage : public PageBody<TableControllerBody> {
 public:
  TablePage() : PageBody(std::unique_ptr<QWidget, DeleteLater>(new TableWidget)) {}
  TableWidget& tableView() override { return dynamic_cast<TableWidget&>(widget()); }
  bool isKeyboardInUse() override { return tableView().isKeyboardInUse(); }
};

}  // namespace kelvasi
