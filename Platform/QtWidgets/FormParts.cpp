#include "Platform/QtWidgets/FormParts.h"

#include <QPainter>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {
constexpr double radius = 12;
}

Card::Card(QWidget* parent) : QFrame(parent) {
  setFrameShape(QFrame::NoFrame);
}

void Card::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(Qt::NoPen);
  painter.setBrush(palette().color(QPalette::Base));
  painter.drawRoundedRect(rect(), radius, radius);
}

BackgroundControl::BackgroundControl(QWidget* parent) : QAbstractButton(parent) {
  setFocusPolicy(Qt::NoFocus);
}

void BackgroundControl::paintEvent(QPaintEvent*) {
  QPainter(this).fillRect(rect(), palette().color(QPalette::Light));
}

FormTitle::FormTitle(QWidget* parent) : QLabel(parent) {
  setFont(qtFont(Font::boldSystem(17)));
}

FormHeading::FormHeading(QWidget* parent) : QLabel(parent) {
  setFont(qtFont(Font::boldSystem(13)));
  setForegroundRole(QPalette::PlaceholderText);
  setContentsMargins(14, 14, 0, 0);
}

}  // namespace kelvasi
