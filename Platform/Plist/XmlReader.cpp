// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/XmlReader.h"

#include <algorithm>
#include <array>
#include <pugixml.hpp>

#include "Platform/Plist/Allowance.h"
#include "Platform/Plist/PlistLimits.h"
#include "Platform/Plist/Utf8.h"
#include "Platform/Plist/XmlMarkup.h"
#include "Platform/Plist/XmlScalars.h"

namespace kelvasi {

namespace {

using pugi::xml_node;

bool isNothing(std::string_view text) {
  return trimmed(text).empty();
}

std::optional<PlistValue> flag(std::string_view text, bool value) {
  if (!isNothing(text)) return std::nullopt;
  return PlistValue(value);
}

struct ScalarRule {
  std::string_view name;
  std::optional<PlistValue> (*read)(std::string_view text);
};
constexpr std::array scalarRules{
    ScalarRule{"integer", xmlInteger},
    ScalarRule{"real", xmlReal},
    ScalarRule{"date", xmlDate},
    ScalarRule{"data", xmlData},
    ScalarRule{"true", [](std::string_view text) { return flag(text, true); }},
    ScalarRule{"false", [](std::string_view text) { return flag(text, false); }},
};

// Comments and white space may stand between elements.
bool isBetween(const xml_node& node) {
  if (node.type() == pugi::node_comment) return isPlainComment(node.value());
  return node.type() == pugi::node_pcdata && isNothing(node.value());
}

// The first node from this one on that counts; null where none does.
xml_node counting(xml_node node) {
  while (node && isBetween(node)) node = node.next_sibling();
  return node;
}

bool isElement(const xml_node& node, std::string_view name) {
  return node.type() == pugi::node_element && node.name() == name && !node.first_attribute();
}

class Reader {
 public:
  // `level` counts the containers around the value. Absent for what is no value.
  PlistValue value(const xml_node& node, int level);

 private:
  PlistValue dictionary(const xml_node& node, int level);
  PlistValue array(const xml_node& node, int level);
  // The text of a string or key: that of its one piece where it needs no change, else put together in
  // `whole`.
  static std::optional<std::string_view> textOf(const xml_node& node, std::string& whole);
  static PlistValue scalar(const xml_node& node);

  Allowance allowance_{plistLimits::values, 0};
};

PlistValue Reader::value(const xml_node& node, int level) {
  if (node.type() != pugi::node_element || node.first_attribute() || !allowance_.takeValues(1)) return {};
  const std::string_view name = node.name();
  const bool isDictionary = name == "dict";
  if (isDictionary || name == "array") {
    if (level == plistLimits::levels) return {};
    return isDictionary ? dictionary(node, level + 1) : array(node, level + 1);
  }
  if (name != "string") return scalar(node);
  std::string whole;
  const auto text = textOf(node, whole);
  return text ? PlistValue(*text) : PlistValue();
}

PlistValue Reader::dictionary(const xml_node& node, int level) {
  const auto entries = PlistDictionary::make();
  std::string whole;
  std::size_t count = 0;
  for (xml_node key = counting(node.first_child()); key; key = counting(key.next_sibling())) {
    if (++count > plistLimits::dictionaryEntries || !isElement(key, "key")) return {};
    const auto name = textOf(key, whole);
    if (!allowance_.takeValues(1) || !name) return {};
    key = counting(key.next_sibling());
    PlistValue entry = value(key, level);
    if (entry.isAbsent()) return {};
    entries->set(*name, std::move(entry));
  }
  return entries;
}

PlistValue Reader::array(const xml_node& node, int level) {
  const auto elements = PlistArray::make();
  for (xml_node child = counting(node.first_child()); child; child = counting(child.next_sibling())) {
    PlistValue element = value(child, level);
    if (element.isAbsent()) return {};
    elements->append(std::move(element));
  }
  return elements;
}

std::optional<std::string_view> Reader::textOf(const xml_node& node, std::string& whole) {
  const xml_node first = node.first_child();
  if (first.type() == pugi::node_pcdata && !first.next_sibling()) {
    const std::string_view text = first.value();
    if (text.find('&') == std::string_view::npos) return text;
  }
  whole.clear();
  for (xml_node piece = first; piece; piece = piece.next_sibling()) {
    if (piece.type() == pugi::node_cdata) {
      whole += piece.value();
    } else if (piece.type() == pugi::node_comment) {
      if (!isPlainComment(piece.value())) return std::nullopt;
    } else if (piece.type() != pugi::node_pcdata || !appendXmlText(whole, piece.value())) {
      return std::nullopt;
    }
  }
  return whole;
}

// Of one piece, unlike a text.
PlistValue Reader::scalar(const xml_node& node) {
  const auto rule = std::ranges::find(scalarRules, std::string_view(node.name()), &ScalarRule::name);
  const xml_node content = node.first_child();
  const bool isWhole = !content || (content.type() == pugi::node_pcdata && !content.next_sibling());
  if (rule == scalarRules.end() || !isWhole) return {};
  return rule->read(content.value()).value_or(PlistValue());
}

bool isPlainProlog(const xml_node& node) {
  switch (node.type()) {
    case pugi::node_declaration:
      return isPlainEncoding(node.attribute("encoding").as_string("UTF-8"));
    case pugi::node_pi:
      return isPlainInstruction(node.value());
    case pugi::node_doctype:
      return isPlainDoctype(node.value());
    default:
      return false;
  }
}

bool isPlistElement(const xml_node& node) {
  const pugi::xml_attribute version = node.first_attribute();
  return node.type() == pugi::node_element && std::string_view(node.name()) == "plist" &&
         (!version || (isPlistVersion(version.name(), version.value()) && !version.next_attribute()));
}

// The value of a document that holds one plist element with one value and nothing else.
PlistValue valueOf(const pugi::xml_document& document) {
  xml_node root = counting(document.first_child());
  while (isPlainProlog(root)) root = counting(root.next_sibling());
  if (!isPlistElement(root) || counting(root.next_sibling())) return {};
  const xml_node top = counting(root.first_child());
  if (!top || counting(top.next_sibling())) return {};
  return Reader().value(top, 0);
}

// Two pieces of markup a value, and some around them: what the parser's memory is bounded by. Small documents
// cannot hold more.
bool isWithinBounds(std::string_view document) {
  constexpr std::size_t markup = 2 * plistLimits::values + 1024;
  if (document.size() <= markup) return true;
  return document.size() <= plistLimits::documentBytes &&
         static_cast<std::size_t>(std::ranges::count(document, '<')) <= markup;
}

// Whether there is a comment or a CDATA section, or what looks like one.
bool mayHavePieces(std::string_view document) {
  for (std::size_t at = document.find('!'); at != std::string_view::npos; at = document.find('!', at + 1)) {
    const std::string_view next = document.substr(at + 1, 1);
    if (next == "-" || next == "[") return true;
  }
  return false;
}

// White space beside a comment or a CDATA section may be a text's; without these it is a text's only where it
// stands alone, and need not be kept elsewhere.
unsigned parseOptions(std::string_view document) {
  constexpr unsigned always = pugi::parse_cdata | pugi::parse_comments | pugi::parse_pi |
                              pugi::parse_declaration | pugi::parse_doctype | pugi::parse_fragment;
  return always | (mayHavePieces(document) ? pugi::parse_ws_pcdata : pugi::parse_ws_pcdata_single);
}

}  // namespace

std::optional<PlistValue> readXmlPlist(std::string_view document) {
  if (!isWithinBounds(document) || !isCleanUtf8(document)) return std::nullopt;
  pugi::xml_document parsed;
  if (!parsed.load_buffer(document.data(), document.size(), parseOptions(document), pugi::encoding_utf8))
    return std::nullopt;
  PlistValue value = valueOf(parsed);
  if (value.isAbsent()) return std::nullopt;
  return value;
}

}  // namespace kelvasi
