// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/LogLevel.h"

#include <algorithm>
#include <array>
#include <cstdlib>

namespace kelvasi {

namespace {
constexpr const char* variable = "KELVASI_LOG_LEVEL";
constexpr std::array<std::string_view, 8> names{"emerg",   "alert",  "crit", "err",
                                                "warning", "notice", "info", "debug"};

bool isNumber(std::string_view text) {
  return text.size() == 1 && text[0] >= '0' && text[0] <= '7';
}
}  // namespace

LogLevel::LogLevel(std::string_view text) : LogLevel() {
  const auto name = std::ranges::find(names, text);
  if (name != names.end()) {
    highest_ = static_cast<int>(name - names.begin());
  } else if (isNumber(text)) {
    highest_ = text[0] - '0';
  } else {
    complaint_ = std::string(variable) +
                 " is neither a level from emerg to debug nor a number from 0 to 7: " + std::string(text);
  }
}

LogLevel LogLevel::fromEnvironment(const LogLevel& unasked) {
  const char* text = std::getenv(variable);
  return text && *text ? LogLevel(text) : unasked;
}

}  // namespace kelvasi
