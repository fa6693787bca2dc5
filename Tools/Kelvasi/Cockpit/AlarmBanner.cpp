// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/AlarmBanner.h"

#include <QAccessible>
#include <QMouseEvent>
#include <algorithm>
#include <chrono>

#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto alarmTime = 12s;
constexpr auto wordTime = 2s;
constexpr int widest = 440;
constexpr int margin = 12;
constexpr int barHeight = 44;
constexpr double besideShape = 28;  // points before the words

}  // namespace

AlarmBanner::AlarmBanner(QWidget& window, std::function<void()> open)
    : QWidget(&window), open_(std::move(open)) {
  setAttribute(Qt::WA_DeleteOnClose);  // goes with the window
  hide();
  setCursor(Qt::PointingHandCursor);
  window.installEventFilter(this);
  timer_.setSingleShot(true);
  connect(&timer_, &QTimer::timeout, this, [this] { hide(); });
}

void AlarmBanner::say(const std::string& words) {
  words_ = shown(words);
  isAlarm_ = true;
  setAccessibleName(tr("Alarm"));
  showFor(alarmTime);
}

// An alarm is not covered by less.
void AlarmBanner::tell(const std::string& words) {
  if (isVisible() && isAlarm_) return;
  words_ = shown(words);
  isAlarm_ = false;
  setAccessibleName({});
  showFor(wordTime);
}

void AlarmBanner::showFor(std::chrono::milliseconds time) {
  setAccessibleDescription(words_);
  place();
  show();
  raise();
  update();
  timer_.start(time);
  QAccessibleEvent alert(this, QAccessible::Alert);
  QAccessible::updateAccessibility(&alert);
}

void AlarmBanner::place() {
  const QSize room = parentWidget()->size();
  const int width = std::min(widest, room.width() - 2 * margin);
  const double high = heightOfWords(words_, textSize::text, width - 2 * margin - besideShape, true);
  const int height = std::max(static_cast<int>(leastRow) + 8, static_cast<int>(high) + 2 * margin);
  setGeometry((room.width() - width) / 2, barHeight + margin, width, height);
}

bool AlarmBanner::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::Resize && watched == parent()) place();
  return QWidget::eventFilter(watched, event);
}

void AlarmBanner::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const Canvas canvas(painter, coloursFor(palette()));
  const QRectF card = QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5);
  painter.setPen(QPen(isAlarm_ ? canvas.colours.poor : canvas.colours.line, 1));
  painter.setBrush(canvas.colours.surface);
  painter.drawRoundedRect(card, 12, 12);
  const auto shape = isAlarm_ ? cockpit::Verdict::veryPoor : cockpit::Verdict::none;
  canvas.verdict({card.left() + margin + 8, card.center().y()}, shape);
  const double width = card.width() - 2 * margin - besideShape;
  const double high = heightOfWords(words_, textSize::text, width, true);
  canvas.words({card.left() + margin + besideShape, card.center().y() - high / 2, width, high}, words_,
               {.size = textSize::text, .isBold = true});
}

void AlarmBanner::mousePressEvent(QMouseEvent* event) {
  event->accept();
}

void AlarmBanner::mouseReleaseEvent(QMouseEvent*) {
  hide();
  if (isAlarm_) open_();
}

}  // namespace kelvasi
