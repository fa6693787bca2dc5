// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiCell.h"

#include <utility>

namespace kelvasi {

namespace {

constexpr double fontSize = 15.0;
constexpr double keyIndent = 10;
constexpr double gap = 50;  // between key and value where they do not both fit
constexpr double scrollHeight = 50;

std::unique_ptr<Label> makeLabel(UserInterface& ui, const Font& font) {
  auto label = ui.makeLabel();
  label->setFont(font);
  label->setAlignment(TextAlignment::left);
  return label;
}

double centred(double height, double in) {
  return (in - height) * 0.5;
}

Rect keyFrame(const Rect& bounds, Size size) {
  return {bounds.x + keyIndent, centred(size.height, bounds.height), size.width, size.height};
}

}  // namespace

KelvasiCell::KelvasiCell(UserInterface& ui, TableView& table, StyleKey styleKey, std::string reuseIdentifier)
    : TableViewCell(table.makeCellBody(styleKey.style), std::move(reuseIdentifier)),
      ui_(ui),
      key_(makeLabel(ui, Font::boldSystem(fontSize))) {
  body().contentView().addSubview(*key_);
}

KelvasiCell::KelvasiCell(UserInterface& ui, TableView& table, CellStyle style, std::string reuseIdentifier)
    : TableViewCell(table.makeCellBody(style), std::move(reuseIdentifier)),
      ui_(ui),
      key_(makeLabel(ui, Font::boldSystem(fontSize))),
      value_(makeLabel(ui, Font::system(fontSize))),
      view_(ui.makeScrollView()) {
  view_->addSubview(*key_);
  view_->addSubview(*value_);
  body().contentView().addSubview(*view_);
}

void KelvasiCell::setValue(std::string_view text) {
  if (value_) value_->setText(text);
}

// The value too is measured in the bold font, though drawn in the regular one.
Size KelvasiCell::sizeOf(const Label& label) const {
  return ui_.sizeOfText(label.text(), Font::boldSystem(fontSize));
}

void KelvasiCell::setLayoutKey() {
  body().layOutStandard();
  key_->setFrame(keyFrame(body().contentView().bounds(), sizeOf(*key_)));
}

void KelvasiCell::setLayout() {
  setLayoutKey();
  if (!value_) return;
  const Rect bounds = body().contentView().bounds();
  const Size key = sizeOf(*key_);
  const Size value = sizeOf(*value_);
  const double need = key.width + keyIndent + gap + value.width;
  const double left =
      need < bounds.width ? bounds.width - value.width : bounds.x + keyIndent + key.width + gap;
  value_->setFrame({left, centred(value.height, bounds.height), value.width, value.height});
  const double contentWidth = need > bounds.width ? bounds.width + key.width + value.width : bounds.width;
  view_->setContentSize({contentWidth, scrollHeight});
  view_->setFrame({bounds.x, bounds.y, bounds.width, scrollHeight});
}

}  // namespace kelvasi
