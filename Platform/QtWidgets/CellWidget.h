// SPDX-License-Identifier: Apache-2.0
// One row of a table: its content, its accessory and the line below it.
#pragma once

#include <QWidget>

#include "Platform/QtWidgets/PaintedViews.h"
#include "Platform/UserInterface/TableViewCell.h"

namespace kelvasi {

class CellWidget : public QWidget, public CellBody {
 public:
  CellWidget(QWidget& table, CellStyle style);

  // For the application.
  Container& contentView() override { return content_; }
  void layOutStandard() override;
  void setAccessory(CellAccessory accessory) override;
  Label& textLabel() override { return textLabel_; }

  // For the table. A cell that comes to another row forgets how far it was scrolled sideways.
  void showRow(std::size_t row);
  std::size_t row() const { return row_; }
  // How strongly the row is marked as pressed or selected, 0 to 1.
  void setMark(double strength);
  // Whether the keyboard is at this row.
  void setFocusMark(bool marked);
  // Null when nothing in the row scrolls.
  QtScrollView* scrollView() const { return content_.group.scrollView(); }

  // What the row says, its name first.
  QStringList texts() const;
  // The same for those who do not see it.
  QString spokenName() const { return texts().value(0); }
  QString spokenValue() const { return texts().mid(1).join(QStringLiteral(", ")); }
  // Has a screen reader hear what is new since the last time.
  void tellChanges();
  bool opens() const { return accessory_ == CellAccessory::disclosureIndicator; }
  bool isChecked() const { return accessory_ == CellAccessory::checkmark; }
  bool hasFocusMark() const { return hasFocusMark_; }

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  // The area left of the accessory.
  struct Content : Container {
    explicit Content(CellWidget& cell) : group([&cell] { cell.update(); }) {}
    void setFrame(const Rect& frame) override { area = frame; }
    Rect bounds() const override { return {0, 0, area.width, area.height}; }
    void addSubview(View& view) override { group.add(view); }
    Rect area;
    PaintedGroup group;
  };

  QColor ground() const;
  // The part of the row that is used: in a wide window values stay near their names.
  QRect column() const;
  void paintAccessory(QPainter& painter) const;
  void paintLine(QPainter& painter) const;
  void paintFocus(QPainter& painter) const;

  CellStyle style_;
  CellAccessory accessory_ = CellAccessory::none;
  std::size_t row_ = 0;
  double mark_ = 0;
  bool hasFocusMark_ = false;
  Content content_{*this};
  QtLabel textLabel_;
  QStringList told_;
};

}  // namespace kelvasi
