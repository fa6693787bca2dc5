// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/ChartPage.h"

#include <QContextMenuEvent>
#include <QHBoxLayout>
#include <QLineF>
#include <algorithm>
#include <chrono>
#include <cmath>
#include <utility>

#include "Cockpit/Words/Age.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

namespace {

using namespace cockpit;
using namespace std::chrono_literals;

constexpr auto holdTime = 500ms;
constexpr QSize imageSize(960, 600);  // points
constexpr double imageScale = 2;

}  // namespace

ChartPage::ChartPage(QWidget* parent, ChartSurroundings surroundings, std::vector<ChartLineKey> lines)
    : CockpitPage(tr("Chart"), parent),
      around_(std::move(surroundings)),
      followsServing_(lines.empty()),
      bar_(new QWidget(this)),
      length_(new QLabel(bar_)) {
  setFocusPolicy(Qt::StrongFocus);
  setAttribute(Qt::WA_AcceptTouchEvents);
  setAccessibleName(title());
  for (const ChartLineKey& line : lines) chart_.add(line);
  fillBar();
  hold_.setSingleShot(true);
  hold_.setInterval(holdTime);
  connect(&hold_, &QTimer::timeout, this, [this] {
    if (pressed_ && !isDragged_) letGo(*pressed_, true);
  });
}

BarButton* ChartPage::addButton(const QString& text, const QString& name, std::function<void()> action) {
  auto* const button = new BarButton(text, bar_);
  button->setAccessibleName(name);
  button->setMinimumSize(static_cast<int>(leastRow), static_cast<int>(leastRow));
  connect(button, &QAbstractButton::clicked, this, std::move(action));
  bar_->layout()->addWidget(button);
  return button;
}

void ChartPage::fillBar() {
  auto* const layout = new QHBoxLayout(bar_);
  layout->setContentsMargins(static_cast<int>(gap), 0, static_cast<int>(gap), 0);
  layout->setSpacing(0);
  addButton(QStringLiteral("\u2212"), tr("Longer time"), [this] {
    takeKey({QEvent::KeyPress, Qt::Key_Minus, {}});
  });
  length_->setFont(qtFont(Font::system(textSize::secondary)));
  length_->setAlignment(Qt::AlignCenter);
  layout->addWidget(length_);
  addButton(QStringLiteral("+"), tr("Shorter time"), [this] {
    takeKey({QEvent::KeyPress, Qt::Key_Plus, {}});
  });
  layout->addStretch();
  toNow_ = addButton(tr("Now"), tr("Back to now"), [this] { takeKey({QEvent::KeyPress, Qt::Key_Home, {}}); });
  addButton(tr("Save"), tr("Save the chart"), [this] {
    if (save_) save_();
  });
}

void ChartPage::refresh() {
  if (!isVisible()) return;
  take();
  length_->setText(QString::fromStdString(durationText(chart_.length())));
  length_->setAccessibleName(tr("Time shown"));
  toNow_->setVisible(!chart_.follows() || !picture_.cursors.empty());
  setAccessibleDescription(texts().join(QStringLiteral(". ")));
  update();
}

void ChartPage::take() {
  const Arrival now = around_.now();
  chart_.keepTimeOf(around_.time);
  if (followsServing_) {
    for (const ChartLineKey& line : std::vector(chart_.lines())) chart_.remove(line);
    for (const ChartLineKey& line : around_.cockpit.chartLines(now)) chart_.add(line);
  }
  const double wide = ChartPainting(picture_, room(), now).plot().width();
  picture_ = around_.cockpit.draw(chart_, now, static_cast<std::size_t>(std::max(2.0, wide / 2)));
}

QStringList ChartPage::texts() const {
  QStringList texts;
  for (std::size_t place = 0; place < picture_.lines.size(); ++place)
    texts.append(shown(picture_.lines[place].name + ", " + legendWords(picture_, place, around_.now())));
  for (const ChartCursor& cursor : picture_.cursors) texts.append(shown("at " + cursor.timeText));
  if (!picture_.why.empty()) texts.append(shown(picture_.why));
  return texts;
}

QRectF ChartPage::room() const {
  return QRectF(rect()).adjusted(0, 0, 0, -bar_->height());
}

double ChartPage::placeOf(const QPointF& position) const {
  const QRectF plot = ChartPainting(picture_, room(), around_.now()).plot();
  return std::clamp((position.x() - plot.left()) / plot.width(), 0.0, 1.0);
}

void ChartPage::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const Canvas canvas(painter, coloursFor(palette()));
  painter.fillRect(rect(), canvas.colours.ground);
  ChartPainting(picture_, room(), around_.now()).paint(canvas);
  canvas.fill(bar_->geometry(), canvas.colours.surface);
  canvas.rule(QRectF(bar_->geometry()).adjusted(0, 0, 0, -bar_->height()));
}

void ChartPage::resizeEvent(QResizeEvent*) {
  const int high = bar_->sizeHint().height();
  bar_->setGeometry(0, height() - high, width(), high);
  refresh();
}

void ChartPage::show(Arrival from, Arrival to, Arrival cursor) {
  around_.time.show(from, to);
  around_.time.setCursor(0, cursor);
  around_.time.setCursor(1, std::nullopt);
}

QImage ChartPage::image() const {
  const CockpitColours& colours = coloursFor(palette());
  QImage image(imageSize * imageScale, QImage::Format_RGB32);
  image.setDevicePixelRatio(imageScale);
  image.fill(colours.ground);
  QPainter painter(&image);
  painter.setRenderHint(QPainter::Antialiasing);
  const Canvas canvas(painter, colours);
  const TextStyle style = around_.cockpit.style();
  const double high = lineHeight(textSize::text);
  const std::string times = dateText(picture_.from, style) + " to " + clockText(picture_.to, style);
  canvas.text({pageMargin, pageMargin, imageSize.width() - 2 * pageMargin, high}, shown(times),
              {.isBold = true});
  const double top = pageMargin + high;
  ChartPainting(picture_, {0, top, 1.0 * imageSize.width(), imageSize.height() - top - gap}, picture_.to)
      .paint(canvas);
  return image;
}

std::string ChartPage::csv() {
  return around_.cockpit.csv(chart_, around_.now());
}

}  // namespace kelvasi
