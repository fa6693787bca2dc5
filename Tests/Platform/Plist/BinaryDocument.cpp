// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/Plist/BinaryDocument.h"

namespace kelvasi::testing {

namespace {

constexpr std::size_t offsetSize = 4;
constexpr std::size_t referenceSize = 2;

void append(Bytes& bytes, std::uint64_t number, std::size_t size) {
  while (size-- > 0) bytes.push_back(static_cast<std::uint8_t>(number >> (8 * size)));
}

}  // namespace

BinaryDocument::BinaryDocument() : objects_{'b', 'p', 'l', 'i', 's', 't', '0', '0'} {}

BinaryDocument& BinaryDocument::add(const Bytes& object) {
  offsets_.push_back(objects_.size());
  objects_.insert(objects_.end(), object.begin(), object.end());
  return *this;
}

BinaryDocument& BinaryDocument::addText(std::string_view text) {
  Bytes object{static_cast<std::uint8_t>(0x50 + text.size())};
  object.insert(object.end(), text.begin(), text.end());
  return add(object);
}

BinaryDocument& BinaryDocument::addReferences(std::uint8_t kind, std::size_t count,
                                              std::initializer_list<std::uint16_t> numbers) {
  Bytes object{static_cast<std::uint8_t>(kind | (count < 15 ? count : 15))};
  if (count >= 15) object.push_back(0x11);
  if (count >= 15) append(object, count, 2);
  for (const std::uint16_t number : numbers) append(object, number, referenceSize);
  return add(object);
}

BinaryDocument& BinaryDocument::addArray(std::initializer_list<std::uint16_t> elements) {
  return addReferences(0xa0, elements.size(), elements);
}

BinaryDocument& BinaryDocument::addDictionary(std::initializer_list<std::uint16_t> keysThenValues) {
  return addReferences(0xd0, keysThenValues.size() / 2, keysThenValues);
}

Bytes BinaryDocument::bytes(std::uint64_t top) const {
  Bytes document = objects_;
  for (const std::size_t offset : offsets_) append(document, offset, offsetSize);
  append(document, 0, 6);
  append(document, offsetSize, 1);
  append(document, referenceSize, 1);
  append(document, offsets_.size(), 8);
  append(document, top, 8);
  append(document, objects_.size(), 8);
  return document;
}

}  // namespace kelvasi::testing
