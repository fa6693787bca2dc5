// SPDX-License-Identifier: Apache-2.0
// The words of a rule, one after the other.
#pragma once

#include <chrono>
#include <cstddef>
#include <optional>
#include <string_view>

namespace kelvasi::survey {

class RuleWords {
 public:
  explicit RuleWords(std::string_view text) : text_(text) { skipBlanks(); }

  std::size_t position() const { return at_; }
  bool isAtEnd() const { return at_ == text_.size(); }
  // The word ahead: a name, a number, or a sign such as "<=" or "..". Empty at the end.
  std::string_view ahead() const;
  void advance();
  bool take(std::string_view word);

  // What is not ahead is left where it is.
  std::optional<double> number();
  std::optional<std::chrono::nanoseconds> duration();

 private:
  void skipBlanks();

  std::string_view text_;
  std::size_t at_ = 0;
};

}  // namespace kelvasi::survey
