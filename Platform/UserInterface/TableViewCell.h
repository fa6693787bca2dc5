// SPDX-License-Identifier: Apache-2.0
// One row of a table on the screen.
#pragma once

#include <memory>
#include <string>
#include <utility>

#include "Platform/UserInterface/Label.h"
#include "Platform/UserInterface/View.h"

namespace kelvasi {

enum class CellStyle {
  oneLabel,       // the platform's default
  twoLabelValue,  // a label on the left, a value on the right
};

enum class CellAccessory { none, disclosureIndicator, checkmark };

// The toolkit's half of a cell.
class CellBody {
 public:
  virtual ~CellBody() = default;

  // The area left of the accessory; laid out by layOutStandard().
  virtual Container& contentView() = 0;
  virtual void layOutStandard() = 0;
  virtual void setAccessory(CellAccessory accessory) = 0;
  // The style's own first label.
  virtual Label& textLabel() = 0;
};

// The base of the application's cells. A table owns the cells that it shows or keeps for reuse.
class TableViewCell {
 public:
  TableViewCell(std::unique_ptr<CellBody> body, std::string reuseIdentifier)
      : body_(std::move(body)), reuseIdentifier_(std::move(reuseIdentifier)) {}
  virtual ~TableViewCell() = default;
  TableViewCell(const TableViewCell&) = delete;
  TableViewCell& operator=(const TableViewCell&) = delete;

  CellBody& body() const { return *body_; }
  const std::string& reuseIdentifier() const { return reuseIdentifier_; }

 private:
  std::unique_ptr<CellBody> body_;
  std::string reuseIdentifier_;
};

}  // namespace kelvasi
