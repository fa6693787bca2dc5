// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CockpitFront.h"

#include <QBoxLayout>
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QWindow>
#include <algorithm>
#include <chrono>
#include <utility>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/Layer.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Platform/QtWidgets/StackWidget.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/TopWidget.h"
#include "Tools/Kelvasi/Cockpit/AlarmBanner.h"
#include "Tools/Kelvasi/Cockpit/BlockAccess.h"
#include "Tools/Kelvasi/Cockpit/CockpitCard.h"
#include "Tools/Kelvasi/Cockpit/CockpitPane.h"
#include "Tools/Kelvasi/Cockpit/TouchWatch.h"
#include "Tools/OperatorFile.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto tickTime = 1s;
constexpr auto motionTime = 180ms;
constexpr auto callPause = 2s;  // between two sounds
constexpr int wide = 900;       // points, from which panes and cockpit stand beside each other
constexpr int sideways = 560;   // the same, where the window is wider than high
constexpr int paneWidth = 390;  // of the panes in a wide window
constexpr int narrowPane = 320;
constexpr int widestCockpit = 440;

// The cockpit over all of the window.
class CockpitLayer : public Layer {
 public:
  CockpitLayer(QWidget& window, QWidget& itsContent) : Layer(window), content_(itsContent) {
    content_.setParent(this);
    content_.setGeometry(rect());
    content_.show();
    show();
    raise();
  }

 protected:
  void resizeEvent(QResizeEvent*) override { content_.setGeometry(rect()); }

 private:
  QWidget& content_;
};

StackWidget& stackOf(const QWidget& window) {
  for (QWidget* const child : window.findChildren<QWidget*>())
    if (auto* const stack = dynamic_cast<StackWidget*>(child)) return *stack;
  throw std::logic_error("a window without panes");
}

bool isCovered(const QWidget& window, const QWidget* except) {
  return std::ranges::any_of(window.children(), [except](QObject* child) {
    const auto* const layer = dynamic_cast<Layer*>(child);
    return layer && layer != except && !layer->isHidden();
  });
}

}  // namespace

CockpitFront::CockpitFront(TopWidget& window, KelvasiApp& app, const Surroundings& surroundings)
    : QObject(&window),
      window_(window),
      app_(app),
      around_(surroundings),
      cockpit_(std::make_unique<cockpit::Cockpit>(setUp())),
      pages_(std::make_unique<CockpitPages>(*cockpit_, *this)),
      card_(new CockpitCard([this] { return snapshot(); }, [this] { open(); })),
      pane_(new CockpitPane([this] { close(); })),
      side_(new CockpitPane({})),
      banner_(new AlarmBanner(window, [this] { pages_->openAlarms(pageHolder()); })),
      motion_(QStringLiteral("org.gnome.desktop.interface"), QStringLiteral("enable-animations"),
              [this](const QVariant& value) {
                isAnimated_ = value.toBool();
                pane_->setAnimated(isAnimated_);
                side_->setAnimated(isAnimated_);
              }) {
  installBlockAccess();
  pane_->setParent(&window);
  pane_->hide();
  pane_->setRoot(pages_->face(*pane_));
  side_->setParent(&window);
  side_->hide();
  side_->setRoot(pages_->chart(*side_, {}));
  stackOf(window).setFoot(card_);
  window.setKeys([this](QKeyEvent& event) { return takeKey(event); });
  window.installEventFilter(this);
  app.model()->gatherReadings(
      [this](const Readings& readings, const Intake& intake) { cockpit_->take(readings, intake); });
  connect(&timer_, &QTimer::timeout, this, [this] { tick(); });
  timer_.start(tickTime);
  tellLink();
  arrange();
  watchTouches();
}

CockpitFront::~CockpitFront() = default;

cockpit::CockpitSetUp CockpitFront::setUp() {
  cockpit::CockpitSetUp setUp;
  setUp.style.minus = "\u2212";
  setUp.style.eastOfUtc = [this](Arrival at) {
    return std::chrono::seconds(
        around_.clock.localZone({std::chrono::duration<double>(at).count()}).secondsFromGmt);
  };
  setUp.operators = loadOperators().operators;
  setUp.onAlarm = [this](const cockpit::AlarmLine& line) { alarm(line); };
  return setUp;
}

// Alarms may come thick and fast; sounds do not.
void CockpitFront::alarm(const cockpit::AlarmLine& line) {
  banner_->say(line.words);
  if (line.time - lastCall_ < callPause) return;
  lastCall_ = line.time;
  around_.attention.call(line.ruleText, "Alarm", line.words);
}

QString CockpitFront::bannerWords() const {
  return banner_->isVisible() ? banner_->words() : QString();
}

Arrival CockpitFront::now() const {
  return arrivalAt(around_.clock.now());
}

void CockpitFront::tick() {
  if (!app_.model()) return;
  tellLink();
  cockpit_->pass(now());
  refresh();
}

void CockpitFront::tellLink() {
  const KelvasiModel& model = *app_.model();
  if (!model.showsAnotherTechnology()) technologyOfPanes_ = model.technology();
  cockpit_->hear({.source = cockpit::LinkReport::Source::daemon,
                  .isConnected = model.isConnected(),
                  .reason = model.isConnected() ? "" : "the daemon has not answered",
                  .technology = model.technology(),
                  .panes = model.showsAnotherTechnology() ? technologyOfPanes_ : ""});
}

void CockpitFront::refresh() {
  card_->refresh();
  pane_->refresh();
  side_->refresh();
}

const char* CockpitFront::placeName() const {
  if (layer_) return "full";
  if (pane_->isVisible()) return "beside";
  return card_->isVisible() ? "card" : "none";
}

const CockpitPage* CockpitFront::shownPage() const {
  return pane_->isVisible() ? &pane_->top() : nullptr;
}

bool CockpitFront::eventFilter(QObject* watched, QEvent* event) {
  if (watched == &window_ && event->type() == QEvent::Resize) arrange();
  if (watched == &window_ && event->type() == QEvent::ContextMenu) {
    auto& menu = dynamic_cast<QContextMenuEvent&>(*event);
    return askMore(menu.globalPos());
  }
  return QObject::eventFilter(watched, event);
}

void CockpitFront::watchTouches() {
  QWindow* const window = window_.windowHandle();
  if (!window) return;
  new TouchWatch(*window, {.twoFingers = [this] { markNow(); }, .fromEdge = [this] { goBack(); }});
}

// Where the user is: in the cockpit's pages while they cover the panes, else in the panes.
void CockpitFront::goBack() {
  if (isCovered(window_, layer_)) return;
  if (pane_->isCovering()) return pane_->goBack();
  stackOf(window_).goBack();
}

// Without a word: a note may follow from the list of events.
void CockpitFront::markNow() {
  if (isCovered(window_, layer_)) return;
  cockpit_->mark(now());
  banner_->tell("Marked");
  refresh();
}

// Beside the panes where there is room for both.
void CockpitFront::arrange() {
  if (layer_) return;
  auto* const layout = qobject_cast<QBoxLayout*>(window_.layout());
  QWidget& panes = *layout->itemAt(0)->widget();
  const int width = window_.width();
  const bool isSideways = width >= sideways && width > window_.height();
  const bool isBeside = width >= wide || isSideways;
  layout->setDirection(QBoxLayout::LeftToRight);
  layout->setSpacing(isBeside ? 1 : 0);
  if (isBeside) {
    panes.setFixedWidth(width < wide ? width / 2 : width < 3 * paneWidth ? narrowPane : paneWidth);
    layout->addWidget(pane_, 1);
    pane_->setCovering(false);
    pane_->show();
    pane_->refresh();
  } else {
    panes.setMinimumWidth(0);
    panes.setMaximumWidth(QWIDGETSIZE_MAX);
    layout->removeWidget(pane_);
    pane_->hide();
  }
  arrangeChart(width >= wide);
  stackOf(window_).setFoot(isBeside ? nullptr : card_);
}

void CockpitFront::arrangeChart(bool isBeside) {
  auto* const layout = qobject_cast<QBoxLayout*>(window_.layout());
  pane_->setMaximumWidth(isBeside ? widestCockpit : QWIDGETSIZE_MAX);
  if (isBeside) {
    layout->addWidget(side_, 1);
  } else {
    layout->removeWidget(side_);
  }
  side_->setVisible(isBeside);
  side_->refresh();
}

void CockpitFront::open() {
  if (pane_->isVisible()) return pane_->top().firstFocus().setFocus();
  const QPixmap before = isAnimated_ ? window_.grab() : QPixmap();
  layer_ = new CockpitLayer(window_, *pane_);
  pane_->setCovering(true);
  pane_->refresh();
  pane_->top().firstFocus().setFocus();
  slide(before, true);
}

// The cockpit comes from below, where its card is, and goes there.
void CockpitFront::slide(const QPixmap& before, bool isUp) {
  if (before.isNull()) return;
  new SlideOverlay(window_, window_.rect(), {before, isUp ? window_.grab() : QPixmap()},
                   isUp ? SlideOverlay::Direction::upwards : SlideOverlay::Direction::downwards, 0,
                   motionTime);
}

void CockpitFront::close() {
  if (!layer_) return;
  const QPixmap before = isAnimated_ ? window_.grab() : QPixmap();
  pane_->goToRoot();
  pane_->hide();
  pane_->setParent(&window_);
  Layer* const gone = layer_;
  layer_ = nullptr;
  delete gone;  // NOLINT(cppcoreguidelines-owning-memory): the window's child
  arrange();
  refresh();
  slide(before, false);
}

void CockpitFront::openPane(const std::string& nodePath) {
  close();
  if (!layer_ && pane_->isVisible()) pane_->goToRoot();
  const auto row = app_.openPath(nodePath);
  for (QWidget* const child : window_.findChildren<QWidget*>()) {
    auto* const table = dynamic_cast<TableWidget*>(child);
    if (!table || !table->isVisible()) continue;
    table->setFocus(Qt::OtherFocusReason);
    if (row) table->goTo(*row);
    return;
  }
}

// "Chart 2026-11-22 at 21.57.02.png", numbered where one of that second is there.
void CockpitFront::keepFile(const std::string& ending, std::span<const std::uint8_t> bytes) {
  std::string time = cockpit::dateText(now(), cockpit_->style());
  std::ranges::replace(time, ':', '.');
  const std::string name = around_.directory + "/Chart " + time.replace(time.find(' '), 1, " at ");
  std::string path = name + ending;
  for (int copy = 2; around_.files.exists(path); ++copy) path = name + " " + std::to_string(copy) + ending;
  if (around_.files.write(path, bytes)) return around_.ui.showFileNotice("Chart saved", path);
  around_.ui.showAlert("File Error", "Unable to write file to disk", "Close");
}

// What is to be opened comes sideways then, and the cockpit not from below.
CockpitPane& CockpitFront::pageHolder() {
  const bool wasAnimated = std::exchange(isAnimated_, false);
  open();
  isAnimated_ = wasAnimated;
  return *pane_;
}

bool CockpitFront::takeKey(QKeyEvent& event) {
  if (isCovered(window_, layer_)) return false;
  if ((event.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier)) != 0) return false;
  switch (event.key()) {
    case Qt::Key_O:
      if (layer_) {
        close();
      } else {
        open();
      }
      return true;
    case Qt::Key_Slash:
      pages_->openSearch(pageHolder());
      return true;
    case Qt::Key_Question:
      pages_->openKeys(pageHolder());
      return true;
    case Qt::Key_G:
      if (!side_->isVisible()) pages_->openChart(pageHolder(), {});
      if (side_->isVisible()) side_->top().setFocus();
      return true;
    case Qt::Key_A:
      pages_->openAlarms(pageHolder());
      return true;
    case Qt::Key_C:
      pages_->openCoverage(pageHolder());
      return true;
    case Qt::Key_Asterisk:
      return pinRow();
    case Qt::Key_E:
      pages_->openEvents(pageHolder());
      return true;
    case Qt::Key_M:
      pages_->openNote(pageHolder());
      return true;
    default:
      return false;
  }
}

// Of the row under a place of the screen.
bool CockpitFront::askMore(const QPoint& place) {
  if (isCovered(window_, nullptr)) return false;
  for (QWidget* at = window_.childAt(window_.mapFromGlobal(place)); at; at = at->parentWidget()) {
    auto* const table = dynamic_cast<TableWidget*>(at);
    if (!table) continue;
    const auto row = table->rowUnder(table->viewport()->mapFromGlobal(place));
    return row && openSheetOf(*table, *row);
  }
  return false;
}

// Of the row at which the keyboard is.
bool CockpitFront::pinRow() {
  for (QWidget* const child : window_.findChildren<QWidget*>()) {
    auto* const table = dynamic_cast<TableWidget*>(child);
    const CellWidget* const cell = table && table->isVisible() ? table->cellAtKeyboard() : nullptr;
    if (!cell) continue;
    const auto path = cockpit_->rowPath(app_.pathOfRow(cell->row()));
    if (path) pages_->togglePin(*path);
    refresh();
    return path.has_value();
  }
  return false;
}

bool CockpitFront::openSheetOf(TableWidget& table, std::size_t row) {
  const CellWidget* const cell = table.cellAt(row);
  if (!cell) return false;
  const auto path = cockpit_->rowPath(app_.pathOfRow(row));
  if (path) pages_->openSheet(pageHolder(), *path);
  return path.has_value();
}

}  // namespace kelvasi
