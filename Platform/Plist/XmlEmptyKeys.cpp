#include "Platform/Plist/XmlEmptyKeys.h"

#include "Platform/Plist/XmlTokens.h"

namespace kelvasi {

namespace {

constexpr std::string_view keyTag = "<key";

}  // namespace

bool mayHaveEmptyKeys(std::string_view document) {
  constexpr std::string_view afterName = "/ \t\r\n";
  for (std::size_t at = document.find(keyTag); at != std::string_view::npos;
       at = document.find(keyTag, at + 1)) {
    const std::string_view next = document.substr(at + keyTag.size(), 1);
    if (!next.empty() && afterName.find(next) != std::string_view::npos) return true;
  }
  return false;
}

std::string withEmptyKeysOpened(std::string_view document) {
  std::string opened;
  opened.reserve(document.size());
  XmlTokens tokens(document);
  while (true) {
    const std::string_view before = tokens.rest();
    const XmlToken token = tokens.next();
    if (token.kind == XmlToken::Kind::end || token.kind == XmlToken::Kind::malformed) return opened;
    const bool isEmptyKey = token.kind == XmlToken::Kind::emptyTag && token.text == "key";
    opened += isEmptyKey ? "<key></key>" : before.substr(0, before.size() - tokens.rest().size());
  }
}

}  // namespace kelvasi
