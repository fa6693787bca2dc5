#include "Platform/Plist/XmlGuard.h"

#include <algorithm>
#include <array>

#include "Platform/Plist/Allowance.h"
#include "Platform/Plist/PlistLimits.h"
#include "Platform/Plist/Utf8.h"
#include "Platform/Plist/XmlMarkup.h"
#include "Platform/Plist/XmlScalars.h"
#include "Platform/Plist/XmlTokens.h"

namespace kelvasi {

namespace {

using Kind = XmlToken::Kind;

bool isNothing(std::string_view text) {
  return trimmed(text).empty();
}

struct ScalarRule {
  std::string_view name;
  bool (*accepts)(std::string_view text);
};
constexpr std::array scalarRules{ScalarRule{"string", isXmlString}, ScalarRule{"integer", isXmlInteger},
                                 ScalarRule{"real", isXmlReal},     ScalarRule{"date", isXmlDate},
                                 ScalarRule{"data", isXmlData},     ScalarRule{"true", isNothing},
                                 ScalarRule{"false", isNothing}};
constexpr ScalarRule keyRule{"key", isXmlString};

class Guard {
 public:
  explicit Guard(std::string_view document) : tokens_(document) {}
  bool accepts();

 private:
  XmlToken nextTag();
  XmlToken firstTag();
  bool value(const XmlToken& tag, int level);
  bool dictionary(int level);
  bool array(int level);
  bool scalar(const XmlToken& tag, const ScalarRule& rule);

  XmlTokens tokens_;
  Allowance allowance_{plistLimits::values, 0};
};

bool isEndOf(const XmlToken& token, std::string_view name) {
  return token.kind == Kind::endTag && token.text == name;
}

// The next token that is neither a comment nor blank.
XmlToken Guard::nextTag() {
  while (true) {
    const XmlToken token = tokens_.next();
    const bool skipped = token.kind == Kind::comment
                             ? isPlainComment(token.text)
                             : token.kind == Kind::characters && isNothing(token.text);
    if (!skipped) return token;
  }
}

XmlToken Guard::firstTag() {
  while (true) {
    const XmlToken token = nextTag();
    const bool skipped = token.kind == Kind::doctype
                             ? isPlainDoctype(token.text)
                             : token.kind == Kind::instruction && isPlainInstruction(token.text);
    if (!skipped) return token;
  }
}

bool Guard::accepts() {
  const XmlToken root = firstTag();
  if (root.kind != Kind::startTag || root.text != "plist" || !isPlistVersion(root.attributes)) return false;
  return value(nextTag(), 0) && isEndOf(nextTag(), "plist") && nextTag().kind == Kind::end;
}

// `level` counts the containers around the value.
bool Guard::value(const XmlToken& tag, int level) {
  const bool empty = tag.kind == Kind::emptyTag;
  if ((!empty && tag.kind != Kind::startTag) || !tag.attributes.empty()) return false;
  if (!allowance_.takeValues(1)) return false;
  const bool isDictionary = tag.text == "dict";
  if (isDictionary || tag.text == "array") {
    if (level == plistLimits::levels) return false;
    return empty || (isDictionary ? dictionary(level + 1) : array(level + 1));
  }
  const auto rule = std::ranges::find(scalarRules, tag.text, &ScalarRule::name);
  return rule != scalarRules.end() && scalar(tag, *rule);
}

bool Guard::dictionary(int level) {
  for (std::size_t entries = 0; entries <= plistLimits::dictionaryEntries; ++entries) {
    const XmlToken key = nextTag();
    if (isEndOf(key, "dict")) return true;
    const bool isTag = key.kind == Kind::startTag || key.kind == Kind::emptyTag;
    if (!isTag || key.text != keyRule.name || !key.attributes.empty()) return false;
    if (!allowance_.takeValues(1) || !scalar(key, keyRule) || !value(nextTag(), level)) return false;
  }
  return false;
}

bool Guard::array(int level) {
  while (true) {
    const XmlToken element = nextTag();
    if (isEndOf(element, "array")) return true;
    if (!value(element, level)) return false;
  }
}

// Only strings and keys may be put together from several pieces.
bool Guard::scalar(const XmlToken& tag, const ScalarRule& rule) {
  if (tag.kind == Kind::emptyTag) return rule.accepts("");
  XmlToken piece = tokens_.next();
  if (rule.accepts != isXmlString) {
    const bool hasText = piece.kind == Kind::characters;
    if (!rule.accepts(hasText ? piece.text : "")) return false;
    return isEndOf(hasText ? tokens_.next() : piece, rule.name);
  }
  for (; !isEndOf(piece, rule.name); piece = tokens_.next()) {
    const bool fits = piece.kind == Kind::characters ? isXmlString(piece.text)
                      : piece.kind == Kind::comment  ? isPlainComment(piece.text)
                                                     : piece.kind == Kind::cdata;
    if (!fits) return false;
  }
  return true;
}

}  // namespace

bool isSafeXmlPlist(std::string_view document) {
  return document.size() <= plistLimits::documentBytes && isCleanUtf8(document) && Guard(document).accepts();
}

}  // namespace kelvasi
