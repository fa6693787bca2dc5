// SPDX-License-Identifier: Apache-2.0
// Blocks below each other, scrolled by finger, wheel and keys. Those with an action can be gone to by
// keyboard.
#pragma once

#include <QAbstractScrollArea>
#include <QTimer>
#include <functional>
#include <optional>

#include "Tools/Kelvasi/Cockpit/Block.h"

class QScrollPrepareEvent;

namespace kelvasi {

class BlockView : public QAbstractScrollArea {
 public:
  using Make = std::function<Blocks(double width)>;

  BlockView(QWidget* parent, Make make);

  // Makes the blocks anew; place and selection stay.
  void refresh();
  const Blocks& blocks() const { return blocks_; }
  // While a finger or the keyboard is at a block nothing should change places. Called when that changes.
  void setOnHold(std::function<void(bool isHeld)> onHold) { onHold_ = std::move(onHold); }
  // Goes to the next block with an action, or to the one before it. False at the end.
  bool select(bool next);
  std::optional<std::size_t> selected() const { return selected_; }
  // Does what a tap on the block does.
  void act(std::size_t place);
  QRectF areaInView(std::size_t place) const;
  QRect areaOnScreen(std::size_t place) const;
  QString selectedText() const { return selected_ ? blocks_[*selected_].spoken : QString(); }

 protected:
  bool viewportEvent(QEvent* event) override;
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  void showEvent(QShowEvent* event) override;
  void scrollContentsBy(int dx, int dy) override;
  void keyPressEvent(QKeyEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;

 private:
  bool isUsable(std::size_t place) const;
  double topOf(std::size_t place) const;
  std::optional<std::size_t> blockAt(const QPointF& position) const;
  void bringIntoSight(std::size_t place);
  void press(std::optional<std::size_t> place);
  void tellHold();
  void tellChanges(const Blocks& before);
  void askMore(std::size_t place);

  Make make_;
  std::function<void(bool)> onHold_;
  Blocks blocks_;
  double whole_ = 0;
  std::optional<std::size_t> selected_;
  std::optional<std::size_t> pressed_;
  QTimer hold_;
  bool isHeld_ = false;
};

}  // namespace kelvasi
