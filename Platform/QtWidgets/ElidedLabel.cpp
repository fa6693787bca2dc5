// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/ElidedLabel.h"

#include <QPainter>
#include <QStyle>

namespace kelvasi {

QSize ElidedLabel::minimumSizeHint() const {
  return {1, QLabel::minimumSizeHint().height()};
}

void ElidedLabel::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  const QRect area = contentsRect();
  style()->drawItemText(&painter, area, static_cast<int>(alignment()), palette(), isEnabled(),
                        QFontMetricsF(font()).elidedText(text(), Qt::ElideRight, area.width()),
                        foregroundRole());
}

}  // namespace kelvasi
