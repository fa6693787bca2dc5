#include "Tools/Kelvasi/ScreenshotTour.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPixmap>
#include <chrono>
#include <cstdio>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Platform/QtWidgets/TableWidget.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto turnTime = 50ms;
constexpr int patience = 300;  // turns: 15 s

QWidget& window() {
  return *QApplication::topLevelWidgets().constFirst();
}

template <typename Widget>
Widget* findVisible() {
  for (QWidget* const widget : window().findChildren<QWidget*>()) {
    auto* const found = dynamic_cast<Widget*>(widget);
    if (found && found->isVisible()) return found;
  }
  return nullptr;
}

bool isStill() {
  const auto* const modal = findVisible<ModalLayer>();
  return !findVisible<SlideOverlay>() && !(modal && modal->isRising());
}

bool isLong(const CellWidget& cell) {
  return cell.scrollView() && cell.scrollView()->furthestOffset() > 0;
}

}  // namespace

ScreenshotTour::ScreenshotTour(const std::string& directory)
    : directory_(QString::fromStdString(directory)), steps_(steps()), patience_(patience) {
  if (directory.empty()) return;
  QObject::connect(&turn_, &QTimer::timeout, [this] { advance(); });
  turn_.start(turnTime);
}

void ScreenshotTour::advance() {
  if (!isStill()) return;
  const bool isDone = steps_[at_]();
  if (!isDone && --patience_ > 0) return;
  patience_ = patience;
  if (++at_ < steps_.size()) return;
  turn_.stop();
  QCoreApplication::quit();
}

std::vector<ScreenshotTour::Step> ScreenshotTour::steps() {
  const auto once = [](auto action) -> Step {
    return [action] {
      action();
      return true;
    };
  };
  const Step openFirst = once([this] {
    press(Qt::Key_Home);
    press(Qt::Key_Return);
  });
  const Step back = once([this] { press(Qt::Key_Escape); });
  return {
      [this] { return hasRows(); },
      once([this] { shoot("root"); }),
      openFirst,
      openFirst,
      [this] { return hasRows(); },
      once([this] { shoot("deep"); }),
      back,
      back,
      [this] { return lookForLongValue(); },
      once([this] {
        if (scrollLongValue()) shoot("long-value");
      }),
      once([this] { press(Qt::Key_S, Qt::ControlModifier); }),
      once([this] {
        if (!findVisible<ModalLayer>()) return;
        type(QStringLiteral("Call dropped between two cells"));
        shoot("save-view");
      }),
  };
}

void ScreenshotTour::press(int key, Qt::KeyboardModifiers modifiers) const {
  QWidget* const focused = QApplication::focusWidget();
  for (const auto type : {QEvent::KeyPress, QEvent::KeyRelease}) {
    QKeyEvent event(type, key, modifiers);
    QCoreApplication::sendEvent(focused ? focused : &window(), &event);
  }
}

void ScreenshotTour::type(const QString& text) const {
  QKeyEvent event(QEvent::KeyPress, Qt::Key_unknown, Qt::NoModifier, text);
  if (QApplication::focusWidget()) QCoreApplication::sendEvent(QApplication::focusWidget(), &event);
}

void ScreenshotTour::shoot(const char* name) const {
  const QString path = directory_ + QLatin1Char('/') + QLatin1String(name) + QStringLiteral(".png");
  if (!window().grab().save(path)) std::fprintf(stderr, "kelvasi: cannot write %s\n", qPrintable(path));
}

bool ScreenshotTour::hasRows() const {
  const auto* const table = findVisible<TableWidget>();
  return table && table->rows() > 0;
}

// Opens pane after pane, the first branch first, until one shows a value that is wider than the window. Back
// at the root with nothing left to open it is done too.
bool ScreenshotTour::lookForLongValue() {
  for (const CellWidget* const cell : findVisible<TableWidget>()->cellsInSight()) {
    if (isLong(*cell)) return true;
  }
  if (openNextBranch()) return false;
  tried_.pop_back();
  if (tried_.empty()) return true;
  press(Qt::Key_Escape);
  return false;
}

bool ScreenshotTour::openNextBranch() {
  TableWidget& table = *findVisible<TableWidget>();
  for (const CellWidget* const cell : table.cellsInSight()) {
    const std::size_t row = cell->row();
    if (row < tried_.back() || !cell->opens()) continue;
    tried_.back() = row + 1;
    tried_.push_back(0);
    table.open(row);
    return true;
  }
  return false;
}

bool ScreenshotTour::scrollLongValue() const {
  for (const CellWidget* const cell : findVisible<TableWidget>()->cellsInSight()) {
    if (!isLong(*cell)) continue;
    press(Qt::Key_Home);
    for (std::size_t row = 0; row < cell->row(); ++row) press(Qt::Key_Down);
    press(Qt::Key_Right);
    return true;
  }
  std::fprintf(stderr, "kelvasi: no value is wider than the window\n");
  return false;
}

}  // namespace kelvasi
