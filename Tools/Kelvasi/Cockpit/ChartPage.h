// SPDX-License-Identifier: Apache-2.0
// Readings over time. + and - or the wheel zoom, dragging or Left and Right move in time, a tap sets the
// cursor and one with Shift the second, Home follows again.
#pragma once

#include <functional>
#include <optional>

#include "Cockpit/Cockpit.h"
#include "Tools/Kelvasi/Cockpit/CockpitPage.h"

namespace kelvasi {

class ChartPage : public CockpitPage {
 public:
  ChartPage(QWidget* parent, cockpit::Cockpit& cockpit, std::function<Arrival()> now,
            std::vector<cockpit::ChartLineKey> lines);

  // Without lines of its own it draws those of the serving cell and its neighbours.
  void refresh() override;
  bool takeKey(const QKeyEvent& event) override;
  QStringList texts() const override;
  cockpit::Chart& chart() { return chart_; }

 protected:
  void paintEvent(QPaintEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;

 private:
  QRectF plot() const;
  double placeOf(const QPointF& position) const;
  void take();
  void drawBehind(const Canvas& canvas, const QRectF& area) const;
  void drawLine(const Canvas& canvas, const QRectF& area, std::size_t place) const;
  void drawLegend(const Canvas& canvas) const;
  void drawCursors(const Canvas& canvas, const QRectF& area) const;
  double legendHeight() const;

  cockpit::Cockpit& cockpit_;
  std::function<Arrival()> now_;
  bool followsServing_;
  cockpit::Chart chart_;
  cockpit::ChartPicture picture_;
  std::optional<QPointF> pressed_;
  bool isDragged_ = false;
};

}  // namespace kelvasi
