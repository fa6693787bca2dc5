// SPDX-License-Identifier: Apache-2.0
// The bar below the panes.
#pragma once

#include <QWidget>
#include <vector>

#include "Platform/UserInterface/ToolbarItem.h"

class QAbstractButton;
class QHBoxLayout;

namespace kelvasi {

class Toolbar : public QWidget {
 public:
  explicit Toolbar(QWidget* parent);

  // Items of the same kinds as before only change their looks.
  void setItems(const ToolbarItems& items);
  // Null when there is none among the items.
  QAbstractButton* saveButton() const;

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  bool holdsKindsOf(const ToolbarItems& items) const;
  void makeWidgets(const ToolbarItems& items);
  QWidget* widgetFor(const ToolbarItem& item);
  void show(std::size_t place, const ToolbarItem& item);

  ToolbarItems items_;
  std::vector<QWidget*> widgets_;  // children, one for each item; null for a space
  QHBoxLayout* layout_;            // a child
};

}  // namespace kelvasi
