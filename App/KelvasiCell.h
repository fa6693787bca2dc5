// SPDX-License-Identifier: Apache-2.0
// A row of a pane. A key cell shows a name; a value cell a name and a value that can be scrolled sideways
// when both do not fit.
#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "Platform/UserInterface/UserInterface.h"

namespace kelvasi {

class KelvasiCell : public TableViewCell {
 public:
  // Makes a key cell.
  struct StyleKey {
    CellStyle style;
  };
  KelvasiCell(UserInterface& ui, TableView& table, StyleKey styleKey, std::string reuseIdentifier);
  // Makes a value cell.
  KelvasiCell(UserInterface& ui, TableView& table, CellStyle style, std::string reuseIdentifier);

  // Places the labels, measured anew, in the content area.
  void setLayoutKey();
  void setLayout();

  const Label& key() const { return *key_; }
  void setKey(std::string_view text) { key_->setText(text); }
  // Null in a key cell, where setting the value does nothing.
  const Label* value() const { return value_.get(); }
  void setValue(std::string_view text);

 private:
  Size sizeOf(const Label& label) const;

  UserInterface& ui_;
  std::unique_ptr<Label> key_;
  std::unique_ptr<Label> value_;  // absent in a key cell
  std::unique_ptr<ScrollView>
      view_;  // holds both labels of a value cell, so that a long value can be scrolled
};

}  // namespace kelvasi
