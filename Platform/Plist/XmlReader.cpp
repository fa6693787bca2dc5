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

bool isNothing(const char* text) {
  return *text == '\0' || trimmed(text).empty();
}

template <bool value>
std::optional<PlistValue> flag(std::string_view text) {
  if (!trimmed(text).empty()) return std::nullopt;
  return PlistValue(value);
}

// Comments and white space may stand between elements.
bool isBetween(const xml_node& node) {
  if (node.type() == pugi::node_comment) return isPlainComment(node.value());
  return node.type() == pugi::node_pcdata && isNothing(node.value());
}

// The first node from this one on that counts; null where none does.
xml_node counting(xml_node node) {
  while (node && node.type() != pugi::node_element && isBetween(node)) node = node.next_sibling();
  return node;
}

std::size_t childCount(const xml_node& node) {
  std::size_t count = 0;
  for (xml_node child = node.first_child(); child; child = child.next_sibling()) ++count;
  return count;
}

bool isElement(const xml_node& node, std::string_view name) {
  return node.type() == pugi::node_element && node.name() == name && !node.first_attribute();
}

// What an element's text holds before its first child is the element's own value.
//
// Values are written over those that stand there: containers that nobody else holds and the room of strings
// are used again. Each function gives false for what is no value, and then leaves whatever it has written.
class Reader {
 public:
  // Without `hasReferences` no text has any.
  explicit Reader(bool hasReferences) : hasReferences_(hasReferences) {}

  // `level` counts the containers around the value.
  bool read(const xml_node& node, int level, PlistValue& value);

 private:
  struct Element {
    std::string_view name;
    bool (Reader::*read)(const xml_node& node, int level, PlistValue& value);
  };

  bool dictionary(const xml_node& node, int level, PlistValue& value);
  bool array(const xml_node& node, int level, PlistValue& value);
  bool string(const xml_node& node, int level, PlistValue& value);
  template <std::optional<PlistValue> (*readText)(std::string_view text)>
  bool scalar(const xml_node& node, int level, PlistValue& value);

  // The text of a string or key: that of its one piece where it needs no change, else put together in
  // `whole`.
  std::optional<std::string_view> textOf(const xml_node& node, std::string& whole) const;

  bool hasReferences_;
  Allowance allowance_{plistLimits::values, 0};
};

bool Reader::read(const xml_node& node, int level, PlistValue& value) {
  static constexpr std::array<Element, 9> elements{{
      {"string", &Reader::string},
      {"integer", &Reader::scalar<xmlInteger>},
      {"dict", &Reader::dictionary},
      {"array", &Reader::array},
      {"real", &Reader::scalar<xmlReal>},
      {"true", &Reader::scalar<flag<true>>},
      {"false", &Reader::scalar<flag<false>>},
      {"date", &Reader::scalar<xmlDate>},
      {"data", &Reader::scalar<xmlData>},
  }};
  if (node.type() != pugi::node_element || node.first_attribute() || !allowance_.takeValues(1)) return false;
  const auto element = std::ranges::find(elements, std::string_view(node.name()), &Element::name);
  return element != elements.end() && (this->*element->read)(node, level, value);
}

bool Reader::dictionary(const xml_node& node, int level, PlistValue& value) {
  if (level == plistLimits::levels || !isNothing(node.value())) return false;
  if (!value.dictionary() || value.isShared()) {
    value = PlistDictionary::make();
    value.dictionary()->reserve(std::min(childCount(node) / 2, plistLimits::dictionaryEntries));
  }
  PlistDictionary& entries = *value.dictionary();
  std::string whole;
  std::size_t place = 0;
  std::size_t count = 0;
  for (xml_node key = counting(node.first_child()); key; key = counting(key.next_sibling())) {
    if (++count > plistLimits::dictionaryEntries || !isElement(key, "key")) return false;
    const auto name = textOf(key, whole);
    if (!allowance_.takeValues(1) || !name) return false;
    key = counting(key.next_sibling());
    if (!read(key, level + 1, entries.rewrite(*name, place))) return false;
  }
  entries.truncate(place);
  return true;
}

bool Reader::array(const xml_node& node, int level, PlistValue& value) {
  if (level == plistLimits::levels || !isNothing(node.value())) return false;
  if (!value.array() || value.isShared()) {
    value = PlistArray::make();
    value.array()->reserve(std::min(childCount(node), plistLimits::values));
  }
  PlistArray& elements = *value.array();
  std::size_t place = 0;
  for (xml_node child = counting(node.first_child()); child; child = counting(child.next_sibling())) {
    if (!read(child, level + 1, elements.rewrite(place))) return false;
    ++place;
  }
  elements.truncate(place);
  return true;
}

bool Reader::string(const xml_node& node, int, PlistValue& value) {
  std::string whole;
  const auto text = textOf(node, whole);
  if (text) value.set(*text);
  return text.has_value();
}

// Of one piece, unlike a text.
template <std::optional<PlistValue> (*readText)(std::string_view text)>
bool Reader::scalar(const xml_node& node, int, PlistValue& value) {
  if (node.first_child()) return false;
  auto scalar = readText(node.value());
  if (scalar) value = std::move(*scalar);
  return scalar.has_value();
}

std::optional<std::string_view> Reader::textOf(const xml_node& node, std::string& whole) const {
  const xml_node rest = node.first_child();
  const std::string_view text = node.value();
  if (!rest && (!hasReferences_ || text.find('&') == std::string_view::npos)) return text;
  whole.clear();
  if (!appendXmlText(whole, text)) return std::nullopt;
  for (xml_node piece = rest; piece; piece = piece.next_sibling()) {
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
bool readDocument(const pugi::xml_document& document, bool hasReferences, PlistValue& value) {
  xml_node root = counting(document.first_child());
  while (isPlainProlog(root)) root = counting(root.next_sibling());
  if (!isPlistElement(root) || !isNothing(root.value()) || counting(root.next_sibling())) return false;
  const xml_node top = counting(root.first_child());
  if (!top || counting(top.next_sibling())) return false;
  return Reader(hasReferences).read(top, 0, value);
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
                              pugi::parse_declaration | pugi::parse_doctype | pugi::parse_fragment |
                              pugi::parse_embed_pcdata;
  return always | (mayHavePieces(document) ? pugi::parse_ws_pcdata : pugi::parse_ws_pcdata_single);
}

}  // namespace

bool readXmlPlist(std::string_view document, PlistValue& value) {
  if (!isWithinBounds(document) || !isCleanUtf8(document)) return false;
  pugi::xml_document parsed;
  if (!parsed.load_buffer(document.data(), document.size(), parseOptions(document), pugi::encoding_utf8))
    return false;
  return readDocument(parsed, document.find('&') != std::string_view::npos, value);
}

std::optional<PlistValue> readXmlPlist(std::string_view document) {
  PlistValue value;
  if (!readXmlPlist(document, value)) return std::nullopt;
  return value;
}

}  // namespace kelvasi
