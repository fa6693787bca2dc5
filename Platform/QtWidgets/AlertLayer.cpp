// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/AlertLayer.h"

#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <algorithm>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/FormParts.h"

namespace kelvasi {

namespace {

constexpr int widestCard = 280;
constexpr int margin = 12;
constexpr double dimming = 0.4;

QLabel* makeText(const QString& text, const Font& font, QWidget& parent) {
  auto* const label = new QLabel(breakable(text), &parent);
  label->setFont(qtFont(font));
  label->setAlignment(Qt::AlignCenter);
  label->setWordWrap(true);
  label->setTextFormat(Qt::PlainText);
  return label;
}

QFrame* makeLine(QWidget& parent) {
  auto* const line = new QFrame(&parent);
  line->setFixedHeight(1);
  line->setAutoFillBackground(true);
  line->setBackgroundRole(QPalette::Mid);
  return line;
}

}  // namespace

AlertLayer::AlertLayer(QWidget& parent, const AlertText& text) : Layer(parent) {
  setAttribute(Qt::WA_DeleteOnClose);
  setAccessibleName(text.title);
  setAccessibleDescription(text.message);
  auto* const card = new Card(this);
  card->setBackgroundRole(QPalette::ToolTipBase);  // lighter than rows in the dark, to stand out
  card->setFixedWidth(std::min(widestCard, parent.width() - 2 * margin));
  fill(*card, text);
  auto* const layout = new QGridLayout(this);
  layout->addWidget(card, 0, 0, Qt::AlignCenter);
  show();
  raise();
  button_->setFocus();
}

void AlertLayer::fill(Card& card, const AlertText& text) {
  button_ = new BarButton(text.button, &card);
  button_->setDefault(true);
  button_->setObjectName(QStringLiteral("alertButton"));
  connect(button_, &QAbstractButton::clicked, this, [this] { close(); });
  auto* const layout = new QVBoxLayout(&card);
  layout->setContentsMargins(0, 20, 0, 0);
  layout->setSpacing(6);
  auto* const texts = new QVBoxLayout;
  texts->setContentsMargins(margin, 0, margin, 0);
  texts->addWidget(makeText(text.title, Font::boldSystem(17), card));
  texts->addWidget(makeText(text.message, Font::system(14), card));
  layout->addLayout(texts);
  layout->addSpacing(8);
  layout->addWidget(makeLine(card));
  layout->addWidget(button_);
}

void AlertLayer::close() {
  hide();
  deleteLater();
}

void AlertLayer::paintEvent(QPaintEvent*) {
  QColor dark = palette().color(QPalette::Shadow);
  dark.setAlphaF(static_cast<float>(dimming));
  QPainter(this).fillRect(rect(), dark);
}

void AlertLayer::keyPressEvent(QKeyEvent* event) {
  const int key = event->key();
  if (key == Qt::Key_Escape || key == Qt::Key_Return || key == Qt::Key_Enter) close();
}

}  // namespace kelvasi
