// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Accessibility.h"

#include <QAccessible>
#include <QAccessibleWidget>

#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/FileNotice.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/Spinner.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/Toolbar.h"
#include "Platform/QtWidgets/TopWidget.h"

namespace kelvasi {

namespace {

TableWidget& tableOf(const CellWidget& cell) {
  return dynamic_cast<TableWidget&>(*cell.parentWidget()->parentWidget());
}

// A row: its name and value, the value as its description too for readers that know no values of texts.
// Pressing it is a tap on it.
class RowInterface : public QAccessibleWidget {
 public:
  explicit RowInterface(CellWidget& cell) : QAccessibleWidget(&cell, QAccessible::ListItem), cell_(cell) {}

  QString text(QAccessible::Text text) const override {
    if (text == QAccessible::Name) return cell_.spokenName();
    if (text == QAccessible::Value) return cell_.spokenValue();
    if (text == QAccessible::Description)
      return cell_.opens() ? TableWidget::tr("Opens") : cell_.spokenValue();
    return QAccessibleWidget::text(text);
  }
  QAccessible::State state() const override {
    QAccessible::State state = QAccessibleWidget::state();
    state.focusable = true;
    state.focused = cell_.hasFocusMark();
    state.selectable = true;
    state.selected = tableOf(cell_).indexPathForSelectedRow() == IndexPath{0, cell_.row()};
    state.checkable = state.checked = cell_.isChecked();
    return state;
  }
  QAccessibleInterface* parent() const override {
    return QAccessible::queryAccessibleInterface(&tableOf(cell_));
  }
  QStringList actionNames() const override { return {pressAction()}; }
  void doAction(const QString& action) override {
    if (action == pressAction()) tableOf(cell_).open(cell_.row());
  }

 private:
  CellWidget& cell_;
};

// A table: a list of the rows in sight.
class TableInterface : public QAccessibleWidget {
 public:
  explicit TableInterface(TableWidget& table) : QAccessibleWidget(&table, QAccessible::List), table_(table) {}

  QString text(QAccessible::Text text) const override {
    if (text == QAccessible::Description && !table_.emptyText().isEmpty()) return table_.emptyText();
    return QAccessibleWidget::text(text);
  }
  int childCount() const override { return static_cast<int>(table_.cellsInSight().size()); }
  QAccessibleInterface* child(int index) const override {
    const auto cells = table_.cellsInSight();
    const auto place = static_cast<std::size_t>(index);
    return index >= 0 && place < cells.size() ? QAccessible::queryAccessibleInterface(cells[place]) : nullptr;
  }
  int indexOfChild(const QAccessibleInterface* child) const override {
    const auto cells = table_.cellsInSight();
    for (std::size_t place = 0; place < cells.size(); ++place) {
      if (cells[place] == child->object()) return static_cast<int>(place);
    }
    return -1;
  }

 private:
  TableWidget& table_;
};

// What keeps the rest of the window from being used while it is there.
class ModalInterface : public QAccessibleWidget {
 public:
  ModalInterface(QWidget& layer, QAccessible::Role role) : QAccessibleWidget(&layer, role) {}

  QAccessible::State state() const override {
    QAccessible::State state = QAccessibleWidget::state();
    state.modal = true;
    return state;
  }
};

QAccessibleInterface* interfaceOf(const QString&, QObject* object) {
  if (auto* const cell = dynamic_cast<CellWidget*>(object)) return new RowInterface(*cell);
  if (auto* const table = dynamic_cast<TableWidget*>(object)) return new TableInterface(*table);
  if (auto* const top = dynamic_cast<TopWidget*>(object))
    return new QAccessibleWidget(top, QAccessible::Window);
  if (auto* const bar = dynamic_cast<NavigationBar*>(object))
    return new QAccessibleWidget(bar, QAccessible::ToolBar);
  if (auto* const bar = dynamic_cast<Toolbar*>(object))
    return new QAccessibleWidget(bar, QAccessible::ToolBar);
  if (auto* const spinner = dynamic_cast<Spinner*>(object))
    return new QAccessibleWidget(spinner, QAccessible::Animation);
  if (auto* const alert = dynamic_cast<AlertLayer*>(object))
    return new ModalInterface(*alert, QAccessible::AlertMessage);
  if (auto* const layer = dynamic_cast<ModalLayer*>(object))
    return new ModalInterface(*layer, QAccessible::Dialog);
  if (auto* const notice = dynamic_cast<FileNotice*>(object))
    return new QAccessibleWidget(notice, QAccessible::Notification);
  return nullptr;
}

}  // namespace

// Qt keeps each factory once.
void installAccessibility() {
  QAccessible::installFactory(interfaceOf);
}

}  // namespace kelvasi
