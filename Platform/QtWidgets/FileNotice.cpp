// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/FileNotice.h"

#include <QClipboard>
#include <QEvent>
#include <QGuiApplication>
#include <QMouseEvent>
#include <QPainter>
#include <QTimer>
#include <QVBoxLayout>
#include <algorithm>
#include <chrono>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/FormParts.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto showTime = 12s;
constexpr int widest = 440;
constexpr int margin = 12;
constexpr int toolbarHeight = 44;

QLabel* makeText(const QString& text, const Font& font, QWidget& parent) {
  auto* const label = new QLabel(breakable(text), &parent);
  label->setFont(qtFont(font));
  label->setTextFormat(Qt::PlainText);
  label->setWordWrap(true);
  return label;
}

}  // namespace

FileNotice::FileNotice(QWidget& window, const QString& message, const QString& path) : QWidget(&window) {
  for (QObject* const child : window.children()) {
    auto* const earlier = dynamic_cast<FileNotice*>(child);
    if (!earlier || earlier == this) continue;
    earlier->hide();
    earlier->deleteLater();
  }
  setAttribute(Qt::WA_DeleteOnClose);
  setAccessibleName(message);
  setAccessibleDescription(path);
  fill(message, path);
  window.installEventFilter(this);
  QTimer::singleShot(showTime, this, [this] { close(); });
  place();
  show();
  raise();
}

void FileNotice::fill(const QString& message, const QString& path) {
  auto* const card = new Card(this);
  card->setBackgroundRole(QPalette::ToolTipBase);
  auto* const whole = new QVBoxLayout(this);
  whole->setContentsMargins(1, 1, 1, 1);
  whole->addWidget(card);
  auto* const copy = new BarButton(tr("Copy path"), card);
  connect(copy, &QAbstractButton::clicked, this, [this, path] {
    QGuiApplication::clipboard()->setText(path);
    close();
  });
  auto* const layout = new QVBoxLayout(card);
  layout->setContentsMargins(margin + 4, margin, margin + 4, 0);
  layout->setSpacing(2);
  layout->addWidget(makeText(message, Font::boldSystem(15), *card));
  auto* const where = makeText(path, Font::system(13), *card);
  where->setForegroundRole(QPalette::PlaceholderText);
  layout->addWidget(where);
  layout->addWidget(copy, 0, Qt::AlignRight);
}

void FileNotice::place() {
  const QSize room = parentWidget()->size();
  const int width = std::min(widest, room.width() - 2 * margin);
  const int height = layout()->heightForWidth(width);
  setGeometry((room.width() - width) / 2, room.height() - toolbarHeight - margin - height, width, height);
}

bool FileNotice::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::Resize && watched == parent()) place();
  return QWidget::eventFilter(watched, event);
}

// The edge of the card.
void FileNotice::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(Qt::NoPen);
  painter.setBrush(palette().color(QPalette::Dark));
  painter.drawRoundedRect(rect(), 13, 13);
}

void FileNotice::mousePressEvent(QMouseEvent* event) {
  event->accept();
  close();
}

}  // namespace kelvasi
