#include "Platform/Plist/XmlMarkup.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <string>

namespace kelvasi {

namespace {

// Otherwise readers may differ on where the declaration ends.
bool hasClosedQuotes(std::string_view text) {
  return std::ranges::count(text, '"') % 2 == 0 && std::ranges::count(text, '\'') % 2 == 0;
}

}  // namespace

bool isPlistVersion(std::string_view attributes) {
  constexpr std::array<std::string_view, 5> known{"", "version=\"1.0\"", "version='1.0'", "version=\"0.9\"",
                                                  "version='0.9'"};
  return std::ranges::find(known, attributes) != known.end();
}

bool isPlainComment(std::string_view text) {
  return text.find("--") == std::string_view::npos && !text.starts_with('>') && !text.starts_with("->") &&
         !text.ends_with('-');
}

bool isPlainDoctype(std::string_view text) {
  return text.starts_with("DOCTYPE") && text.find_first_of("[<") == std::string_view::npos &&
         hasClosedQuotes(text);
}

bool isPlainInstruction(std::string_view text) {
  std::string lower(text);
  std::ranges::transform(lower, lower.begin(), [](unsigned char letter) { return std::tolower(letter); });
  return hasClosedQuotes(text) &&
         (lower.find("encoding") == std::string::npos || lower.find("utf-8") != std::string::npos);
}

}  // namespace kelvasi
