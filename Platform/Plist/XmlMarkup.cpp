// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/XmlMarkup.h"

#include <algorithm>
#include <cctype>

namespace kelvasi {

namespace {

bool isEvenCount(std::string_view text, char character) {
  bool isEven = true;
  for (auto at = text.find(character); at != text.npos; at = text.find(character, at + 1)) isEven = !isEven;
  return isEven;
}

// Otherwise readers may differ on where the declaration ends.
bool hasClosedQuotes(std::string_view text) {
  return isEvenCount(text, '"') && isEvenCount(text, '\'');
}

}  // namespace

bool isPlistVersion(std::string_view attribute, std::string_view value) {
  return attribute == "version" && (value == "1.0" || value == "0.9");
}

bool isPlainComment(std::string_view text) {
  return text.find("--") == std::string_view::npos && !text.starts_with('>') && !text.starts_with("->") &&
         !text.ends_with('-');
}

bool isPlainDoctype(std::string_view text) {
  const auto has = [&](char character) { return text.find(character) != std::string_view::npos; };
  return !has('[') && !has('<') && !has('>') && hasClosedQuotes(text);
}

bool isPlainEncoding(std::string_view name) {
  return std::ranges::equal(name, std::string_view("utf-8"),
                            [](unsigned char one, char other) { return std::tolower(one) == other; });
}

bool isPlainInstruction(std::string_view text) {
  return hasClosedQuotes(text);
}

}  // namespace kelvasi
