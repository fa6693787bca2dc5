// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/ShownWindow.h"

#include <QAbstractButton>
#include <QApplication>
#include <QJsonArray>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPixmap>
#include <vector>

#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/FileNotice.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Platform/QtWidgets/Spinner.h"
#include "Platform/QtWidgets/StackWidget.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/Toolbar.h"
#include "Tools/Kelvasi/Cockpit/CockpitFront.h"
#include "Tools/Kelvasi/Cockpit/CockpitPane.h"
#include "Tools/Kelvasi/Cockpit/SnapshotJson.h"

namespace kelvasi {

namespace {

constexpr int bestCompression = 0;  // a PNG's quality, as Qt counts it

template <typename Widget>
Widget* findShown(const QWidget& in) {
  for (QWidget* const widget : in.findChildren<QWidget*>()) {
    auto* const found = dynamic_cast<Widget*>(widget);
    if (found && found->isVisible()) return found;
  }
  return nullptr;
}

// Null before the viewer has launched.
QWidget* window() {
  for (QWidget* const widget : QApplication::topLevelWidgets()) {
    if (widget->isVisible() && findShown<StackWidget>(*widget)) return widget;
  }
  return nullptr;
}

template <typename Widget>
Widget* findInWindow() {
  const QWidget* const in = window();
  return in ? findShown<Widget>(*in) : nullptr;
}

QJsonArray rowsOf(const TableWidget& table) {
  QJsonArray rows;
  for (const CellWidget* const cell : table.cellsInSight())
    rows.append(QJsonArray::fromStringList(cell->texts()));
  return rows;
}

QJsonValue saveViewState() {
  const auto* const layer = findInWindow<ModalLayer>();
  if (!layer) return QJsonValue::Null;
  return QJsonObject{{"rows", rowsOf(*findShown<TableWidget>(*layer))},
                     {"description", findShown<QLineEdit>(*layer)->text()}};
}

QJsonValue alertState() {
  const auto* const alert = findInWindow<AlertLayer>();
  if (!alert) return QJsonValue::Null;
  return QJsonObject{{"title", alert->accessibleName()},
                     {"message", alert->accessibleDescription()},
                     {"button", findShown<BarButton>(*alert)->text()}};
}

QJsonValue noticeState() {
  const auto* const notice = findInWindow<FileNotice>();
  if (!notice) return QJsonValue::Null;
  return QJsonObject{{"message", notice->accessibleName()}, {"path", notice->accessibleDescription()}};
}

CockpitFront* cockpitFront() {
  for (QObject* const child : window()->children())
    if (auto* const front = dynamic_cast<CockpitFront*>(child)) return front;
  return nullptr;
}

// What it shows where, and what it knows, as Cockpit/ says it.
QJsonValue cockpitState() {
  CockpitFront* const front = cockpitFront();
  if (!front) return QJsonValue::Null;
  QJsonObject state = jsonOf(cockpit::plistOf(front->snapshot())).toObject();
  const CockpitPage* const page = front->shownPage();
  state.insert("place", front->placeName());
  state.insert("page", page ? QJsonValue(page->title()) : QJsonValue::Null);
  state.insert("banner", front->bannerWords());
  state.insert("selected", page ? page->selectedText() : QString());
  state.insert("texts", page ? QJsonArray::fromStringList(page->texts()) : QJsonArray());
  return state;
}

// Those of the alert or, without one, of the save view or, without that, of the panes.
std::vector<QAbstractButton*> usableButtons() {
  const QWidget* in = findInWindow<AlertLayer>();
  if (!in) in = findInWindow<ModalLayer>();
  const auto* const pane = findInWindow<CockpitPane>();
  if (!in && pane && pane->isCovering()) in = pane;
  if (!in) in = window();
  std::vector<QAbstractButton*> usable;
  for (QAbstractButton* const button : in->findChildren<QAbstractButton*>()) {
    if (button->isVisible() && button->isEnabled() && !button->text().isEmpty()) usable.push_back(button);
  }
  return usable;
}

QJsonArray buttonTexts() {
  QJsonArray texts;
  for (const QAbstractButton* const button : usableButtons()) texts.append(button->text());
  return texts;
}

CellWidget* wideCell() {
  for (CellWidget* const cell : shownTable()->cellsInSight()) {
    if (cell->scrollView() && cell->scrollView()->furthestOffset() > 0) return cell;
  }
  return nullptr;
}

// Where keys go; a window need not be active for it.
QWidget& keyboardFocus() {
  QWidget* const focused = QApplication::focusWidget();
  QWidget& whole = *window();
  if (focused && focused->window() == &whole) return *focused;
  return whole.focusWidget() ? *whole.focusWidget() : whole;
}

void sendKey(int key, Qt::KeyboardModifiers modifiers, const QString& text) {
  for (const auto kind : {QEvent::KeyPress, QEvent::KeyRelease}) {
    if (!window()) return;  // the press closed it
    QKeyEvent event(kind, key, modifiers, text);
    QCoreApplication::sendEvent(&keyboardFocus(), &event);
  }
}

}  // namespace

bool isWindowStill() {
  if (!window()) return false;
  const auto* const modal = findInWindow<ModalLayer>();
  return !findInWindow<SlideOverlay>() && !(modal && modal->isRising());
}

TableWidget* shownTable() {
  const auto* const modal = findInWindow<ModalLayer>();
  return modal ? findShown<TableWidget>(*modal) : findInWindow<TableWidget>();
}

QString shownStatus() {
  return findShown<QLabel>(*findInWindow<Toolbar>())->text();
}

QJsonObject shownState() {
  const auto& bar = *findInWindow<NavigationBar>();
  return {{"title", bar.title()},
          {"back", bar.backButton().isVisible() ? bar.backButton().text() : QString()},
          {"status", shownStatus()},
          {"busy", findShown<Spinner>(*findInWindow<Toolbar>()) != nullptr},
          {"rows", rowsOf(*findShown<TableWidget>(*findInWindow<StackWidget>()))},
          {"buttons", buttonTexts()},
          {"saveView", saveViewState()},
          {"alert", alertState()},
          {"notice", noticeState()},
          {"cockpit", cockpitState()}};
}

bool isAtRoot() {
  return findInWindow<NavigationBar>()->backButton().isHidden();
}

bool showsWideValue() {
  return wideCell() != nullptr;
}

void scrollWideValue() {
  const CellWidget& cell = *wideCell();
  goToRow(cell.texts().first());
  press(Qt::Key_Right);
}

bool goToRow(const QString& name) {
  TableWidget& table = *shownTable();
  table.setFocus();
  if (table.rows() > 0) press(Qt::Key_Home);
  for (std::size_t row = 0; row < table.rows(); ++row) {
    const CellWidget* const cell = table.cellAtKeyboard();
    if (cell && cell->texts().value(0) == name) return true;
    press(Qt::Key_Down);
  }
  return false;
}

void openRow() {
  press(Qt::Key_Return);
}

void press(const QKeySequence& keys) {
  for (int at = 0; at < keys.count(); ++at) {
    const QKeyCombination combination = keys[static_cast<unsigned>(at)];
    sendKey(combination.key(), combination.keyboardModifiers(), {});
  }
}

void type(const QString& text) {
  for (const QChar character : text) sendKey(0, Qt::NoModifier, character);
}

bool click(const QString& text, int times) {
  for (QAbstractButton* const button : usableButtons()) {
    if (button->text() != text) continue;
    for (int click = 0; click < times; ++click) button->click();
    return true;
  }
  return false;
}

bool savePicture(const QString& path) {
  return window()->grab().save(path, nullptr, bestCompression);
}

}  // namespace kelvasi
