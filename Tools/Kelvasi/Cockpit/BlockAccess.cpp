// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/BlockAccess.h"

#include <QAccessibleWidget>
#include <vector>

#include "Tools/Kelvasi/Cockpit/BlockView.h"
#include "Tools/Kelvasi/Cockpit/CockpitCard.h"

namespace kelvasi {

namespace {

// A line. Its view outlives it; blocks come and go, and so their places are what lasts.
class LineInterface : public QAccessibleInterface, public QAccessibleActionInterface {
 public:
  LineInterface(BlockView& view, std::size_t place) : view_(view), place_(place) {}

  bool isValid() const override { return place_ < view_.blocks().size(); }
  QObject* object() const override { return nullptr; }
  QAccessibleInterface* childAt(int, int) const override { return nullptr; }
  QAccessibleInterface* parent() const override { return QAccessible::queryAccessibleInterface(&view_); }
  QAccessibleInterface* child(int) const override { return nullptr; }
  int childCount() const override { return 0; }
  int indexOfChild(const QAccessibleInterface*) const override { return -1; }
  QWindow* window() const override { return view_.window()->windowHandle(); }

  QString text(QAccessible::Text kind) const override {
    if (!isValid()) return {};
    const Block& block = view_.blocks()[place_];
    if (kind == QAccessible::Name) return block.name.isEmpty() ? block.spoken : block.name;
    // The value as its description too, for readers that know no values of texts.
    if (kind == QAccessible::Value || kind == QAccessible::Description) return block.value;
    return {};
  }
  void setText(QAccessible::Text, const QString&) override {}
  QRect rect() const override { return isValid() ? view_.areaOnScreen(place_) : QRect(); }
  QAccessible::Role role() const override {
    if (!isValid()) return QAccessible::NoRole;
    if (view_.blocks()[place_].isHeading) return QAccessible::Heading;
    return QAccessible::ListItem;
  }
  QAccessible::State state() const override {
    QAccessible::State state;
    if (!isValid()) {
      state.invalid = true;
      return state;
    }
    state.invisible = !view_.isVisible();
    state.offscreen = !view_.viewport()->rect().contains(view_.areaInView(place_).toRect());
    state.focusable = state.selectable = static_cast<bool>(view_.blocks()[place_].action);
    state.selected = view_.selected() == place_;
    state.focused = state.selected && view_.hasFocus();
    return state;
  }

  void* interface_cast(QAccessible::InterfaceType type) override {
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface*>(this) : nullptr;
  }
  QStringList actionNames() const override {
    return isValid() && view_.blocks()[place_].action ? QStringList{pressAction()} : QStringList();
  }
  void doAction(const QString& action) override {
    if (action == pressAction() && isValid()) view_.act(place_);
  }
  QStringList keyBindingsForAction(const QString&) const override { return {}; }

 private:
  BlockView& view_;
  std::size_t place_;
};

class ViewInterface : public QAccessibleWidget {
 public:
  explicit ViewInterface(BlockView& view) : QAccessibleWidget(&view, QAccessible::List), view_(view) {}
  ~ViewInterface() override {
    for (const QAccessible::Id id : lines_) QAccessible::deleteAccessibleInterface(id);
  }
  ViewInterface(const ViewInterface&) = delete;
  ViewInterface& operator=(const ViewInterface&) = delete;

  int childCount() const override { return static_cast<int>(view_.blocks().size()); }
  QAccessibleInterface* child(int index) const override {
    if (index < 0 || index >= childCount()) return nullptr;
    const auto place = static_cast<std::size_t>(index);
    while (lines_.size() <= place)
      lines_.push_back(QAccessible::registerAccessibleInterface(new LineInterface(view_, lines_.size())));
    return QAccessible::accessibleInterface(lines_[place]);
  }
  int indexOfChild(const QAccessibleInterface* child) const override {
    for (std::size_t place = 0; place < lines_.size(); ++place)
      if (QAccessible::accessibleInterface(lines_[place]) == child) return static_cast<int>(place);
    return -1;
  }
  QAccessibleInterface* childAt(int x, int y) const override {
    for (std::size_t place = 0; place < view_.blocks().size(); ++place)
      if (view_.areaOnScreen(place).contains(x, y)) return child(static_cast<int>(place));
    return nullptr;
  }
  QAccessibleInterface* focusChild() const override {
    return view_.hasFocus() && view_.selected() ? child(static_cast<int>(*view_.selected())) : nullptr;
  }

 private:
  BlockView& view_;
  mutable std::vector<QAccessible::Id> lines_;
};

QAccessibleInterface* interfaceOf(const QString&, QObject* object) {
  if (auto* const view = dynamic_cast<BlockView*>(object)) return new ViewInterface(*view);
  if (auto* const card = dynamic_cast<CockpitCard*>(object))
    return new QAccessibleWidget(card, QAccessible::Button);
  return nullptr;
}

}  // namespace

// Qt keeps each factory once.
void installBlockAccess() {
  QAccessible::installFactory(interfaceOf);
}

}  // namespace kelvasi
