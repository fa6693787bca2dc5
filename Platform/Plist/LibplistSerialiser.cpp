#include "Platform/Plist/LibplistSerialiser.h"

#include <locale.h>  // NOLINT(modernize-deprecated-headers): for newlocale, which is POSIX and not C

#include <memory>
#include <string_view>

#include "Platform/Plist/BinaryGuard.h"
#include "Platform/Plist/LibplistNode.h"
#include "Platform/Plist/XmlEmptyKeys.h"
#include "Platform/Plist/XmlGuard.h"

namespace kelvasi {

namespace {

// The library reads reals as the locale writes them: under one with a decimal comma, 1.5 would be 1.
class PlainLocale {
 public:
  PlainLocale() : plain_(newlocale(LC_ALL_MASK, "C", nullptr)), previous_(uselocale(plain_)) {}
  ~PlainLocale() {
    uselocale(previous_);
    if (plain_) freelocale(plain_);
  }
  PlainLocale(const PlainLocale&) = delete;
  PlainLocale& operator=(const PlainLocale&) = delete;

 private:
  locale_t plain_;
  locale_t previous_;
};

using Reader = void (*)(const char* document, std::uint32_t size, plist_t* node);

// A peer may pad what it sends to a size that it likes.
bool isPadding(char character) {
  return std::string_view("\0 \t\r\n", 5).find(character) != std::string_view::npos;
}

LibplistNode read(Reader reader, std::string_view document) {
  plist_t node = nullptr;
  reader(document.data(), static_cast<std::uint32_t>(document.size()), &node);
  return LibplistNode(node);
}

// What ends a binary document may look like padding: it is the longest that will do.
LibplistNode nodeFromBinary(std::string_view document) {
  while (!isSafeBinaryPlist({reinterpret_cast<const std::uint8_t*>(document.data()), document.size()})) {
    if (document.empty() || !isPadding(document.back())) return nullptr;
    document.remove_suffix(1);
  }
  return read(plist_from_bin, document);
}

LibplistNode nodeFromXml(std::string_view document) {
  constexpr std::string_view byteOrderMark = "\xef\xbb\xbf";
  if (document.starts_with(byteOrderMark)) document.remove_prefix(byteOrderMark.size());
  while (!document.empty() && isPadding(document.back())) document.remove_suffix(1);
  if (!isSafeXmlPlist(document)) return nullptr;
  if (mayHaveEmptyKeys(document)) return read(plist_from_xml, withEmptyKeysOpened(document));
  return read(plist_from_xml, document);
}

LibplistNode nodeFrom(std::span<const std::uint8_t> bytes) {
  const std::string_view document(reinterpret_cast<const char*>(bytes.data()), bytes.size());
  return document.starts_with(binaryPlistMagic) ? nodeFromBinary(document) : nodeFromXml(document);
}

// A reader would take a bare carriage return for a line feed (XML 1.0, section 2.11).
Bytes withCarriageReturnsKept(std::string_view text) {
  constexpr std::string_view reference = "&#13;";
  Bytes bytes;
  bytes.reserve(text.size());
  for (const char character : text) {
    if (character == '\r') {
      bytes.insert(bytes.end(), reference.begin(), reference.end());
    } else {
      bytes.push_back(static_cast<std::uint8_t>(character));
    }
  }
  return bytes;
}

}  // namespace

std::optional<PlistValue> LibplistSerialiser::parse(std::span<const std::uint8_t> bytes) const {
  const PlainLocale locale;
  const LibplistNode node = nodeFrom(bytes);
  if (!node) return std::nullopt;
  return fromLibplist(node.get());
}

std::optional<Bytes> LibplistSerialiser::serialiseXml(const PlistValue& value) const {
  const PlainLocale locale;
  const LibplistNode node = toLibplist(value);
  if (!node) return std::nullopt;
  char* text = nullptr;
  std::uint32_t size = 0;
  plist_to_xml(node.get(), &text, &size);
  const std::unique_ptr<char, decltype(&plist_to_xml_free)> owned(text, &plist_to_xml_free);
  if (!text) return std::nullopt;
  return withCarriageReturnsKept({text, size});
}

std::optional<Bytes> LibplistSerialiser::serialiseBinary(const PlistValue& value) const {
  const LibplistNode node = toLibplist(value);
  if (!node) return std::nullopt;
  char* content = nullptr;
  std::uint32_t size = 0;
  plist_to_bin(node.get(), &content, &size);
  const std::unique_ptr<char, decltype(&plist_to_bin_free)> owned(content, &plist_to_bin_free);
  if (!content) return std::nullopt;
  return Bytes(content, content + size);
}

}  // namespace kelvasi
