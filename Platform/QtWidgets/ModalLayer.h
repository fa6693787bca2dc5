// SPDX-License-Identifier: Apache-2.0
// A page over the whole window, which rises from the bottom.
#pragma once

#include <QVariantAnimation>

#include "Platform/QtWidgets/Layer.h"

namespace kelvasi {

class Page;

class ModalLayer : public Layer {
 public:
  // Does not own the page, and gives it back unharmed.
  ModalLayer(QWidget& window, Page& page, bool animated);
  ~ModalLayer() override;

  bool isRising() const { return rise_.state() == QAbstractAnimation::Running; }

 protected:
  void resizeEvent(QResizeEvent* event) override;

 private:
  void placePage();

  Page& page_;
  QVariantAnimation rise_;  // the share of the way that is still to go
};

}  // namespace kelvasi
