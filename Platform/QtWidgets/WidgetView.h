// SPDX-License-Identifier: Apache-2.0
// Views that are widgets.
#pragma once

#include <QWidget>

#include "Platform/UserInterface/View.h"

namespace kelvasi {

// What a view that is a widget is besides.
class HasWidget {
 public:
  virtual QWidget& widget() = 0;

 protected:
  ~HasWidget() = default;
};

// For the views of this toolkit that can be put into a window.
inline QWidget& widgetOf(View& view) {
  return dynamic_cast<HasWidget&>(view).widget();
}

inline QRect wholePoints(const Rect& rect) {
  return QRectF(rect.x, rect.y, rect.width, rect.height).toRect();
}

// Destroys a widget when the event at hand is dealt with: it may be the widget's own.
struct DeleteLater {
  void operator()(QWidget* widget) const {
    widget->hide();
    widget->setParent(nullptr);
    widget->deleteLater();
  }
};

// A widget of somebody else's as a view.
class WidgetView : public View, public HasWidget {
 public:
  explicit WidgetView(QWidget& itsWidget) : widget_(itsWidget) {}
  void setFrame(const Rect& frame) override { widget_.setGeometry(wholePoints(frame)); }
  Rect bounds() const override {
    return {0, 0, static_cast<double>(widget_.width()), static_cast<double>(widget_.height())};
  }
  QWidget& widget() override { return widget_; }

 private:
  QWidget& widget_;
};

}  // namespace kelvasi
