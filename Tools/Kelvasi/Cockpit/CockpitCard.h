// SPDX-License-Identifier: Apache-2.0
// The cockpit in the free room below the root pane's rows. A tap opens all of it, as does dragging it up.
#pragma once

#include <QWidget>
#include <functional>
#include <optional>

#include "Cockpit/Snapshot.h"

namespace kelvasi {

class CockpitCard : public QWidget {
 public:
  using Look = std::function<cockpit::Snapshot()>;
  CockpitCard(Look look, std::function<void()> open);

  void refresh();
  // What is worth its room.
  QSize minimumSizeHint() const override;
  QSize sizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;
  void showEvent(QShowEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;

 private:
  void openNow();

  Look look_;
  std::function<void()> open_;
  cockpit::Snapshot snapshot_;
  std::optional<QPointF> pressed_;
};

}  // namespace kelvasi
