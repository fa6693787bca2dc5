// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Toolbar.h"

#include <QHBoxLayout>
#include <QPainter>
#include <algorithm>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/ElidedLabel.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/Spinner.h"

namespace kelvasi {

namespace {

constexpr int barHeight = 44;
constexpr int margin = 10;
constexpr int spacing = 8;

}  // namespace

Toolbar::Toolbar(QWidget* parent) : QWidget(parent), layout_(new QHBoxLayout(this)) {
  setFixedHeight(barHeight);
  setAccessibleName(tr("Status"));
  layout_->setContentsMargins(margin, 0, 2, 0);
  layout_->setSpacing(spacing);
}

void Toolbar::setItems(const ToolbarItems& items) {
  if (!holdsKindsOf(items)) makeWidgets(items);
  items_ = items;
  for (std::size_t place = 0; place < items_.size(); ++place) show(place, items_[place]);
}

bool Toolbar::holdsKindsOf(const ToolbarItems& items) const {
  return std::ranges::equal(items, items_, {}, &ToolbarItem::index, &ToolbarItem::index);
}

void Toolbar::makeWidgets(const ToolbarItems& items) {
  while (QLayoutItem* const item = layout_->takeAt(0)) {
    if (item->widget()) item->widget()->deleteLater();
    delete item;  // NOLINT(cppcoreguidelines-owning-memory): that is how Qt hands it over
  }
  widgets_.clear();
  for (const ToolbarItem& item : items) {
    widgets_.push_back(widgetFor(item));
    if (widgets_.back()) {
      layout_->addWidget(widgets_.back());
    } else {
      layout_->addStretch(1);
    }
  }
}

QWidget* Toolbar::widgetFor(const ToolbarItem& item) {
  if (std::holds_alternative<ActivitySpinner>(item)) return new Spinner(this);
  if (std::holds_alternative<ToolbarLabel>(item)) return new ElidedLabel(this);
  if (std::holds_alternative<FlexibleSpace>(item)) return nullptr;
  auto* const button = new BarButton(tr("Save"), this);
  button->setDefault(true);
  button->setObjectName(QStringLiteral("save"));
  const std::size_t place = widgets_.size();
  connect(button, &QAbstractButton::clicked, this, [this, place] {
    // A copy: the press may change the items.
    if (const auto action = std::get<SaveButton>(items_[place]).action) action();
  });
  return button;
}

void Toolbar::show(std::size_t place, const ToolbarItem& item) {
  if (const auto* spinner = std::get_if<ActivitySpinner>(&item))
    dynamic_cast<Spinner*>(widgets_[place])->setAnimating(spinner->isAnimating, spinner->hidesWhenStopped);
  if (const auto* label = std::get_if<ToolbarLabel>(&item)) {
    auto& shown = dynamic_cast<ElidedLabel&>(*widgets_[place]);
    shown.setFont(qtFont(label->font));
    shown.setText(qtText(label->text));
    shown.setMaximumWidth(static_cast<int>(label->size.width) + 1);
  }
}

QAbstractButton* Toolbar::saveButton() const {
  for (std::size_t place = 0; place < items_.size(); ++place) {
    if (std::holds_alternative<SaveButton>(items_[place]))
      return dynamic_cast<QAbstractButton*>(widgets_[place]);
  }
  return nullptr;
}

void Toolbar::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), palette().color(QPalette::Window));
  painter.fillRect(QRectF(0, 0, width(), 1 / devicePixelRatioF()), palette().color(QPalette::Mid));
}

}  // namespace kelvasi
