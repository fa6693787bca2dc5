// SPDX-License-Identifier: Apache-2.0
#include "Platform/SystemLog.h"

#include <array>
#include <cstdio>
#include <string>

namespace kelvasi {

void SystemLog::print(LogPriority priority, const char* format, ...) {
  if (!wants(priority)) return;
  std::va_list arguments;
  va_start(arguments, format);
  std::va_list again;
  va_copy(again, arguments);
  std::array<char, 512> line;
  const int length = std::vsnprintf(line.data(), line.size(), format, arguments);
  va_end(arguments);
  if (length >= 0 && static_cast<std::size_t>(length) < line.size()) {
    write(priority, std::string_view(line.data(), static_cast<std::size_t>(length)));
  } else if (length >= 0) {
    std::string text(static_cast<std::size_t>(length) + 1, '\0');
    std::vsnprintf(text.data(), text.size(), format, again);
    text.pop_back();
    write(priority, text);
  }
  va_end(again);
}

}  // namespace kelvasi
