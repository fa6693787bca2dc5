// The bar above the panes: where one is, and the way back.
#pragma once

#include <QString>
#include <QWidget>
#include <functional>

namespace kelvasi {

class BarButton;

class NavigationBar : public QWidget {
 public:
  NavigationBar(QWidget* parent, std::function<void()> goBack);

  // `back` names the pane below; empty where there is none.
  void show(const QString& title, const QString& back);
  const QString& title() const { return title_; }
  const BarButton& backButton() const { return *back_; }

 protected:
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void placeBackButton();

  QString title_;
  BarButton* back_;  // a child
};

}  // namespace kelvasi
