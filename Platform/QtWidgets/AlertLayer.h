// SPDX-License-Identifier: Apache-2.0
// A card with a message and one button, over everything else.
#pragma once

#include "Platform/QtWidgets/Layer.h"

namespace kelvasi {

class BarButton;
class Card;

struct AlertText {
  QString title;
  QString message;
  QString button;
};

// Destroys itself when its button is pressed, or Enter or Escape.
class AlertLayer : public Layer {
 public:
  AlertLayer(QWidget& parent, const AlertText& text);

 protected:
  void paintEvent(QPaintEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;

 private:
  void fill(Card& card, const AlertText& text);
  void close();

  BarButton* button_ = nullptr;  // a child
};

}  // namespace kelvasi
