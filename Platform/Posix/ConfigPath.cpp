// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/ConfigPath.h"

#include <cstdlib>

namespace kelvasi {

namespace {

std::filesystem::path pathIn(const char* variable) {
  const char* value = std::getenv(variable);
  return value ? value : "";
}

}  // namespace

std::optional<std::filesystem::path> configPath(std::string_view name) {
  if (const auto chosen = pathIn("XDG_CONFIG_HOME"); chosen.is_absolute()) return chosen / "kelvasi" / name;
  if (const auto home = pathIn("HOME"); home.is_absolute()) return home / ".config/kelvasi" / name;
  return std::nullopt;
}

}  // namespace kelvasi
