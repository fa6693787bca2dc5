// SPDX-License-Identifier: Apache-2.0
// A line that a user types.
#pragma once

#include <string>

#include "Platform/Terminal/Key.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

class LineField {
 public:
  static constexpr std::size_t longest = 200;  // characters

  const std::u32string& characters() const { return text_; }
  std::string text() const;  // UTF-8
  void clear() { text_.clear(), at_ = 0; }
  // Whether the key was one of typing.
  bool take(const terminal::Key& key);
  // What is seen in so many columns, with the cursor in sight, and where that stands.
  std::string seen(int columns, const Look& look) const;
  int cursor(int columns, const Look& look) const;

 private:
  int skipped(int columns, const Look& look) const;
  int columnsBefore(const Look& look) const;

  std::u32string text_;
  std::size_t at_ = 0;
};

}  // namespace kelvasi::top
