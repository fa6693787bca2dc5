// SPDX-License-Identifier: Apache-2.0
// The bar above the panes: where one is, and the way back.
#pragma once

#include <QString>
#include <QWidget>
#include <functional>
#include <optional>

namespace kelvasi {

class BarButton;

class NavigationBar : public QWidget {
 public:
  NavigationBar(QWidget* parent, std::function<void()> goBack);

  // `back` is the title of the pane below, which may be empty; none without such a pane.
  void show(const QString& title, const std::optional<QString>& back);
  const QString& title() const { return title_; }
  const BarButton& backButton() const { return *back_; }

 protected:
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void takeFont();
  void placeBackButton();

  QString title_;
  BarButton* back_;  // a child
};

}  // namespace kelvasi
