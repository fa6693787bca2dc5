// A short text made with a printf format.
#pragma once

#include <array>
#include <cstdarg>
#include <cstdio>
#include <string_view>

namespace kelvasi {

// At most 95 characters; longer results are cut.
class FormattedText {
 public:
  // NOLINTNEXTLINE(cert-dcl50-cpp): so that the compiler compares format and values
  explicit FormattedText(const char* format, ...) __attribute__((format(printf, 2, 3))) {
    std::va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(text_.data(), text_.size(), format, arguments);
    va_end(arguments);
  }
  operator std::string_view() const { return text_.data(); }

 private:
  std::array<char, 96> text_;
};

}  // namespace kelvasi
