// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/ModalLayer.h"

#include "Platform/QtWidgets/FormParts.h"
#include "Platform/QtWidgets/Page.h"

namespace kelvasi {

namespace {
constexpr int duration = 320;  // milliseconds
}

ModalLayer::ModalLayer(QWidget& window, Page& page, bool animated) : Layer(window), page_(page) {
  page.widget().setParent(this);
  if (const auto* const title = page.widget().findChild<FormTitle*>()) setAccessibleName(title->text());
  rise_.setDuration(duration);
  rise_.setEasingCurve(QEasingCurve::OutCubic);
  rise_.setStartValue(1.0);
  rise_.setEndValue(0.0);
  connect(&rise_, &QVariantAnimation::valueChanged, this, [this] { placePage(); });
  if (animated) rise_.start();
  placePage();
  page.widget().show();
  show();
  raise();
  page.firstFocus().setFocus();
}

ModalLayer::~ModalLayer() {
  page_.widget().hide();
  page_.widget().setParent(nullptr);
}

void ModalLayer::placePage() {
  const double below = isRising() ? rise_.currentValue().toDouble() : 0;
  page_.widget().setGeometry(rect().translated(0, qRound(below * height())));
}

void ModalLayer::resizeEvent(QResizeEvent*) {
  placePage();
}

}  // namespace kelvasi
