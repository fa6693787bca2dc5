// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TreeText.h"

#include <array>

namespace kelvasi {

namespace {

struct Escape {
  char character;
  std::string_view text;
};
constexpr std::array escapes{Escape{'\\', "\\\\"}, Escape{'\t', "\\t"}, Escape{'\n', "\\n"},
                             Escape{'\r', "\\r"}};

void appendHexadecimal(std::string& text, unsigned char character) {
  constexpr std::string_view digits = "0123456789abcdef";
  text += "\\x";
  text += digits[character >> 4];
  text += digits[character & 15];
}

void appendEscaped(std::string& text, char character) {
  for (const Escape& escape : escapes) {
    if (escape.character != character) continue;
    text += escape.text;
    return;
  }
  const auto code = static_cast<unsigned char>(character);
  if (code < 0x20 || code == 0x7F) return appendHexadecimal(text, code);
  text += character;
}

void append(std::string& text, std::string_view raw) {
  for (const char character : raw) appendEscaped(text, character);
}

void append(std::string& text, const KelvasiModelNode& node, const std::string& path) {
  append(text, path);
  text += '\t';
  if (node.value()) append(text, *node.value());
  text += '\n';
  if (!node.childNodes()) return;
  for (const NodeRef& child : *node.childNodes())
    append(text, *child, pathByAppending(path, child->displayName()));
}

}  // namespace

std::string treeText(const KelvasiModelNode& root) {
  std::string text;
  append(text, root, "/");
  return text;
}

std::string treeText(const PlistValue& display) {
  PathDictionary nodesByPath;
  return treeText(*KelvasiModelNode::makeTreeFromObject(display, nodesByPath));
}

}  // namespace kelvasi
