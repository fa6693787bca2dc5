// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/LibplistSerialiser.h"

#include <algorithm>
#include <memory>
#include <string_view>

#include "Platform/Plist/BinaryReader.h"
#include "Platform/Plist/LibplistNode.h"
#include "Platform/Plist/PlainLocale.h"
#include "Platform/Plist/XmlReader.h"

namespace kelvasi {

namespace {

std::string_view textOf(std::span<const std::uint8_t> bytes) {
  return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

// A peer may pad what it sends to a size that it likes.
std::string_view withoutPadding(std::string_view document) {
  const std::size_t last = document.find_last_not_of(std::string_view("\0 \t\r\n", 5));
  return document.substr(0, last == std::string_view::npos ? 0 : last + 1);
}

// What ends a document may look like padding, but for the sizes in its trailer, behind which stand 24 bytes:
// it is the longest that will do.
std::optional<PlistValue> readBinary(std::span<const std::uint8_t> bytes) {
  constexpr std::size_t behindSizes = 24;
  const std::size_t least = withoutPadding(textOf(bytes)).size();
  for (std::size_t size = std::min(bytes.size(), least + behindSizes); size >= least; --size) {
    if (auto value = readBinaryPlist(bytes.first(size))) return value;
  }
  return std::nullopt;
}

bool readXml(std::string_view document, PlistValue& value) {
  constexpr std::string_view byteOrderMark = "\xef\xbb\xbf";
  if (document.starts_with(byteOrderMark)) document.remove_prefix(byteOrderMark.size());
  return readXmlPlist(withoutPadding(document), value);
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
  PlistValue value;
  if (!parseOver(value, bytes)) return std::nullopt;
  return value;
}

bool LibplistSerialiser::parseOver(PlistValue& value, std::span<const std::uint8_t> bytes) const {
  const std::string_view document = textOf(bytes);
  if (document.starts_with(binaryPlistMagic)) {
    value = readBinary(bytes).value_or(PlistValue());
  } else if (!readXml(document, value)) {
    value = {};
  }
  return !value.isAbsent();
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
