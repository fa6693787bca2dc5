// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/FormParts.h"

#include <QChildEvent>
#include <QPainter>
#include <QPainterPath>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

constexpr double radius = 12;

// Paints the ground behind a card over its corners.
class CardCorners : public QWidget {
 public:
  explicit CardCorners(ListCard* card) : QWidget(card) {
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setFocusPolicy(Qt::NoFocus);
  }

 protected:
  void paintEvent(QPaintEvent*) override {
    QPainterPath outside;
    outside.addRect(rect());
    QPainterPath inside;
    inside.addRoundedRect(rect(), radius, radius);
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillPath(outside.subtracted(inside), palette().color(QPalette::Light));
  }
};

}  // namespace

QString breakable(QString text) {
  constexpr char16_t zeroWidthSpace = 0x200B;
  return text.replace(QLatin1Char('/'), QLatin1Char('/') + QString(QChar(zeroWidthSpace)));
}

Card::Card(QWidget* parent) : QFrame(parent) {
  setFrameShape(QFrame::NoFrame);
  setBackgroundRole(QPalette::Base);
}

void Card::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(Qt::NoPen);
  painter.setBrush(palette().color(backgroundRole()));
  painter.drawRoundedRect(rect(), radius, radius);
}

ListCard::ListCard(QWidget* parent) : Card(parent) {
  // NOLINTNEXTLINE(cppcoreguidelines-prefer-member-initializer): its coming calls childEvent(), which asks
  corners_ = new CardCorners(this);
}

void ListCard::resizeEvent(QResizeEvent*) {
  corners_->setGeometry(rect());
}

void ListCard::childEvent(QChildEvent* event) {
  Card::childEvent(event);
  if (event->added() && corners_) corners_->raise();
}

BackgroundControl::BackgroundControl(QWidget* parent) : QAbstractButton(parent) {
  setFocusPolicy(Qt::NoFocus);
}

void BackgroundControl::paintEvent(QPaintEvent*) {
  QPainter(this).fillRect(rect(), palette().color(QPalette::Light));
}

FormTitle::FormTitle(QWidget* parent) : ElidedLabel(parent) {
  setFont(qtFont(Font::boldSystem(17)));
}

FormHeading::FormHeading(QWidget* parent) : QLabel(parent) {
  setFont(qtFont(Font::boldSystem(13)));
  setForegroundRole(QPalette::PlaceholderText);
  setContentsMargins(16, 14, 0, 0);
}

}  // namespace kelvasi
