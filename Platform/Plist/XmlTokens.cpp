#include "Platform/Plist/XmlTokens.h"

#include <algorithm>

namespace kelvasi {

namespace {

using Kind = XmlToken::Kind;

constexpr std::string_view whiteSpace = " \t\r\n";

struct Enclosure {
  Kind kind;
  std::string_view open, close;
};
constexpr Enclosure enclosures[] = {{Kind::comment, "<!--", "-->"},
                                    {Kind::cdata, "<![CDATA[", "]]>"},
                                    {Kind::doctype, "<!", ">"},
                                    {Kind::instruction, "<?", "?>"}};

}  // namespace

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(whiteSpace);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(whiteSpace) - first + 1);
}

XmlToken XmlTokens::next() {
  if (rest_.empty()) return {};
  if (rest_.front() == '<') return markup();
  const std::string_view text = rest_.substr(0, rest_.find('<'));
  rest_.remove_prefix(text.size());
  return {Kind::characters, text, {}};
}

XmlToken XmlTokens::markup() {
  for (const Enclosure& enclosure : enclosures) {
    if (rest_.starts_with(enclosure.open)) return enclosed(enclosure.kind, enclosure.open, enclosure.close);
  }
  return tag();
}

XmlToken XmlTokens::enclosed(Kind kind, std::string_view open, std::string_view close) {
  const std::size_t end = rest_.find(close, open.size());
  if (end == std::string_view::npos) return {Kind::malformed, {}, {}};
  const std::string_view text = rest_.substr(open.size(), end - open.size());
  rest_.remove_prefix(end + close.size());
  return {kind, text, {}};
}

XmlToken XmlTokens::tag() {
  const XmlToken token = enclosed(Kind::startTag, "<", ">");
  std::string_view inside = token.text;
  if (token.kind == Kind::malformed || inside.find('<') != std::string_view::npos) {
    return {Kind::malformed, {}, {}};
  }
  if (inside.starts_with('/'))
    return {Kind::endTag, inside.substr(1, inside.find_last_not_of(whiteSpace)), {}};
  const bool empty = inside.ends_with('/');
  if (empty) inside.remove_suffix(1);
  const std::size_t nameEnd = std::min(inside.find_first_of(whiteSpace), inside.size());
  return {empty ? Kind::emptyTag : Kind::startTag, inside.substr(0, nameEnd),
          trimmed(inside.substr(nameEnd))};
}

}  // namespace kelvasi
