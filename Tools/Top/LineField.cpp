// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/LineField.h"

#include <algorithm>

#include "Platform/Plist/Utf8.h"

namespace kelvasi::top {

namespace {

std::string utf8(std::u32string_view characters) {
  std::string text;
  for (const char32_t character : characters) appendUtf8(text, character);
  return text;
}

}  // namespace

std::string LineField::text() const {
  return utf8(text_);
}

bool LineField::take(const terminal::Key& key) {
  using Kind = terminal::Key::Kind;
  switch (key.kind) {
    case Kind::character:
      if (text_.size() < longest && isScalarValue(key.character)) text_.insert(at_++, 1, key.character);
      return true;
    case Kind::backspace:
      if (at_ > 0) text_.erase(--at_, 1);
      return true;
    case Kind::remove:
      if (at_ < text_.size()) text_.erase(at_, 1);
      return true;
    case Kind::left:
      at_ -= at_ > 0 ? 1 : 0;
      return true;
    case Kind::right:
      at_ = std::min(at_ + 1, text_.size());
      return true;
    default:
      return false;
  }
}

int LineField::columnsBefore(const Look& look) const {
  return terminal::widthOf(utf8(std::u32string_view(text_).substr(0, at_)), look.set);
}

int LineField::skipped(int columns, const Look& look) const {
  return std::max(0, columnsBefore(look) - columns + 1);
}

std::string LineField::seen(int columns, const Look& look) const {
  return windowOf(text(), skipped(columns, look), columns, look);
}

int LineField::cursor(int columns, const Look& look) const {
  return columnsBefore(look) - skipped(columns, look);
}

}  // namespace kelvasi::top
