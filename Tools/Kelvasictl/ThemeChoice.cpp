// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ThemeChoice.h"

#include <cstdlib>
#include <filesystem>
#include <sstream>
#include <string_view>
#include <system_error>

#include "Platform/Posix/ConfigPath.h"
#include "Platform/Posix/Files.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

constexpr std::size_t largestFile = std::size_t{1} << 16;

// "15;0": the colours of text and ground, by their numbers; 7 and 9 to 15 are light.
bool isGroundLight() {
  const char* const value = std::getenv("COLORFGBG");
  const std::string_view colours = value ? value : "";
  const std::string_view ground = colours.substr(colours.rfind(';') + 1);
  return ground == "7" || ground == "9" || (ground.size() == 2 && ground[0] == '1');
}

terminal::Theme groundTheme() {
  return isGroundLight() ? terminal::lightTheme() : terminal::darkTheme();
}

terminal::Theme readTheme(const std::string& path) {
  const FileContents file = readFile(path, largestFile);
  if (file.error) throw ToolError(*file.error);
  terminal::Theme theme = groundTheme();
  std::istringstream text(std::string(file.bytes.begin(), file.bytes.end()));
  std::string line;
  for (std::size_t number = 1; std::getline(text, line); ++number) {
    const std::string wrong = theme.change(line);
    if (!wrong.empty()) throw ToolError(path + ": line " + std::to_string(number) + ": " + wrong);
  }
  return theme;
}

}  // namespace

terminal::Theme chosenTheme(const std::string& choice) {
  if (choice == "dark") return terminal::darkTheme();
  if (choice == "light") return terminal::lightTheme();
  if (!choice.empty()) return readTheme(choice);
  const auto path = configPath("terminal.theme");
  std::error_code unreadable;
  return path && std::filesystem::exists(*path, unreadable) ? readTheme(path->native()) : groundTheme();
}

}  // namespace kelvasi
