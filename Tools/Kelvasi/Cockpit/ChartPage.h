// SPDX-License-Identifier: Apache-2.0
// Readings over time. + and -, the wheel or two fingers zoom, dragging or Left and Right move in time, a tap
// or , and . set the cursor, one with Shift, a hold or < and > the second, Home follows again. All charts
// show one time.
#pragma once

#include <QHBoxLayout>
#include <QImage>
#include <QLabel>
#include <QTimer>
#include <functional>
#include <optional>

#include "Cockpit/Cockpit.h"
#include "Platform/QtWidgets/BarButton.h"
#include "Tools/Kelvasi/Cockpit/ChartPainting.h"
#include "Tools/Kelvasi/Cockpit/CockpitPage.h"

class QTouchEvent;

namespace kelvasi {

// What charts are made from. The chart `time` is the one whose time and cursors all of them share.
struct ChartSurroundings {
  cockpit::Cockpit& cockpit;
  cockpit::Chart& time;
  std::function<Arrival()> now;
};

class ChartPage : public CockpitPage {
 public:
  // Without lines of its own it draws those of the serving cell and its neighbours.
  ChartPage(QWidget* parent, ChartSurroundings surroundings, std::vector<cockpit::ChartLineKey> lines);

  void refresh() override;
  bool takeKey(const QKeyEvent& event) override;
  QStringList texts() const override;
  // What S and the button do.
  void setSave(std::function<void()> save) { save_ = std::move(save); }
  void show(Arrival from, Arrival to, Arrival cursor);

  // As a picture with its date, and as the values behind it.
  QImage image() const;
  std::string csv();

 protected:
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;

 private:
  using Change = std::function<void(cockpit::Chart& time)>;

  BarButton* addButton(const QString& text, const QString& name, std::function<void()> action);
  void fillBar();
  QRectF room() const;
  double placeOf(const QPointF& position) const;
  void change(const Change& change);
  void take();
  void zoom(double factor, std::optional<double> place = {});
  void setCursor(std::size_t which, const QPointF& position);
  void moveCursor(std::size_t which, int steps);
  void press(const QPointF& position);
  void drag(const QPointF& position);
  void letGo(const QPointF& position, bool isSecond);
  void touch(const QTouchEvent& event);
  void pinch(const QPointF& one, const QPointF& other);

  ChartSurroundings around_;
  bool followsServing_;
  cockpit::Chart chart_;
  cockpit::ChartPicture picture_;
  std::function<void()> save_;
  QWidget* bar_;  // children
  QLabel* length_;
  BarButton* toNow_ = nullptr;
  std::optional<QPointF> pressed_;
  bool isDragged_ = false;
  std::optional<QLineF> fingers_;  // two of them
  QTimer hold_;
};

}  // namespace kelvasi
