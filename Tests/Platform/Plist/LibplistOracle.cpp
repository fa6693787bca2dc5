// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/Plist/LibplistOracle.h"

#include <array>
#include <bit>
#include <cstdlib>
#include <cstring>
#include <string>

#include "Platform/Plist/BinaryReader.h"
#include "Platform/Plist/BinaryTable.h"
#include "Platform/Plist/LibplistNode.h"
#include "Platform/Plist/PlainLocale.h"

namespace kelvasi::testing {

namespace {

PlistValue fromLibplist(plist_t node);

struct Free {
  // NOLINTNEXTLINE(cppcoreguidelines-no-malloc): this is the RAII of what a library allocated
  void operator()(void* memory) const { std::free(memory); }
};

template <typename Value, void get(plist_t, Value*)>
Value valueOf(plist_t node) {
  Value value{};
  get(node, &value);
  return value;
}

// The library keeps an integer's sign to itself, and shows it where it writes: the binary format has 16 bytes
// for what is unsigned.
bool isUnsigned(plist_t node) {
  constexpr std::uint32_t markerAt = 8;
  constexpr char integerOf16Bytes = 0x14;
  char* content = nullptr;
  std::uint32_t size = 0;
  plist_to_bin(node, &content, &size);
  const std::unique_ptr<char, decltype(&plist_to_bin_free)> owned(content, &plist_to_bin_free);
  return size > markerAt && content[markerAt] == integerOf16Bytes;
}

PlistValue integerFrom(plist_t node) {
  const auto bits = valueOf<std::uint64_t, plist_get_uint_val>(node);
  const auto number = static_cast<std::int64_t>(bits);
  return number < 0 && isUnsigned(node) ? PlistValue(bits) : PlistValue(number);
}

PlistValue stringFrom(plist_t node) {
  const char* text = plist_get_string_ptr(node, nullptr);
  return std::string(text ? text : "");
}

PlistValue dataFrom(plist_t node) {
  std::uint64_t size = 0;
  const auto* bytes = reinterpret_cast<const std::uint8_t*>(plist_get_data_ptr(node, &size));
  return bytes ? Bytes(bytes, bytes + size) : Bytes();
}

PlistValue arrayFrom(plist_t node) {
  const auto array = PlistArray::make();
  const std::unique_ptr<void, Free> position(valueOf<plist_array_iter, plist_array_new_iter>(node));
  for (plist_t item = nullptr;; array->append(fromLibplist(item))) {
    plist_array_next_item(node, position.get(), &item);
    if (!item) return array;
  }
}

PlistValue dictionaryFrom(plist_t node) {
  const auto dictionary = PlistDictionary::make();
  const std::unique_ptr<void, Free> position(valueOf<plist_dict_iter, plist_dict_new_iter>(node));
  while (true) {
    char* key = nullptr;
    plist_t item = nullptr;
    plist_dict_next_item(node, position.get(), &key, &item);
    const std::unique_ptr<char, Free> owned(key);
    if (!item || !key) return dictionary;
    dictionary->set(key, fromLibplist(item));
  }
}

// The library makes its own kind of a dictionary that has but this key, and loses whether its number was
// negative.
PlistValue uidFrom(plist_t node) {
  const auto bits = valueOf<std::uint64_t, plist_get_uid_val>(node);
  return PlistDictionary::make({{"CF$UID", static_cast<std::int64_t>(bits)}});
}

// The library's own call keeps dates as 32-bit seconds and loses the fraction of those before 2001.
PlistValue dateFrom(plist_t node) {
  constexpr double from1970To2001 = 978307200;
  constexpr std::size_t datePlace = 8;  // after the magic
  constexpr std::size_t dateSize = 9;   // the object's kind and a double
  char* document = nullptr;
  std::uint32_t size = 0;
  plist_to_bin(node, &document, &size);
  const std::unique_ptr<char, decltype(&plist_to_bin_free)> owned(document, &plist_to_bin_free);
  if (size < datePlace + dateSize) return {};
  std::array<std::uint8_t, 8> bytes{};
  std::memcpy(bytes.data(), document + datePlace + 1, bytes.size());
  return PlistDate{std::bit_cast<double>(bigEndian(bytes)) + from1970To2001};
}

PlistValue fromLibplist(plist_t node) {
  switch (plist_get_node_type(node)) {
    case PLIST_BOOLEAN:
      return valueOf<std::uint8_t, plist_get_bool_val>(node) != 0;
    case PLIST_UINT:
      return integerFrom(node);
    case PLIST_REAL:
      return valueOf<double, plist_get_real_val>(node);
    case PLIST_STRING:
      return stringFrom(node);
    case PLIST_DATA:
      return dataFrom(node);
    case PLIST_DATE:
      return dateFrom(node);
    case PLIST_ARRAY:
      return arrayFrom(node);
    case PLIST_DICT:
      return dictionaryFrom(node);
    case PLIST_UID:
      return uidFrom(node);
    default:
      return {};
  }
}

}  // namespace

std::optional<PlistValue> readWithLibplist(std::span<const std::uint8_t> document) {
  const PlainLocale locale;
  const std::string_view text(reinterpret_cast<const char*>(document.data()), document.size());
  plist_t node = nullptr;
  const auto read = text.starts_with(binaryPlistMagic) ? plist_from_bin : plist_from_xml;
  read(text.data(), static_cast<std::uint32_t>(text.size()), &node);
  const LibplistNode owned(node);
  if (!node) return std::nullopt;
  return fromLibplist(node);
}

}  // namespace kelvasi::testing
