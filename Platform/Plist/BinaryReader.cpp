// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/BinaryReader.h"

#include <cstring>

#include "Platform/Plist/Allowance.h"
#include "Platform/Plist/BinaryObject.h"
#include "Platform/Plist/BinaryTable.h"
#include "Platform/Plist/PlistLimits.h"

namespace kelvasi {

namespace {

using Span = std::span<const std::uint8_t>;

class Reader {
 public:
  explicit Reader(const BinaryTable& table) : table_(table) {}
  // `level` counts the containers around the value. Absent for what is no value.
  PlistValue value(std::uint64_t number, int level);

 private:
  PlistValue counted(const BinaryObject& object);
  PlistValue array(const BinaryObject& object, int level);
  PlistValue dictionary(const BinaryObject& object, int level);
  PlistValue key(std::uint64_t number);
  std::uint64_t reference(Span references, std::size_t place) const;
  bool holds(const BinaryObject& object, std::size_t referencesEach) const {
    return object.count <= object.content.size() / table_.referenceSize() / referencesEach;
  }

  const BinaryTable& table_;
  Allowance allowance_{plistLimits::values, plistLimits::contentBytes};
};

std::uint64_t Reader::reference(Span references, std::size_t place) const {
  return bigEndian(references.subspan(place * table_.referenceSize(), table_.referenceSize()));
}

PlistValue Reader::value(std::uint64_t number, int level) {
  const auto object = binaryObjectIn(table_.objectAt(number));
  if (!object || !allowance_.takeValues(1)) return {};
  const bool isDictionary = object->kind == BinaryObject::dictionary;
  if (isDictionary || object->kind == BinaryObject::array) {
    if (level == plistLimits::levels) return {};
    return isDictionary ? dictionary(*object, level + 1) : array(*object, level + 1);
  }
  return object->isCounted() ? counted(*object) : scalarOf(*object);
}

PlistValue Reader::counted(const BinaryObject& object) {
  const std::size_t unit = object.kind == BinaryObject::utf16 ? 2 : 1;
  if (object.count > object.content.size() / unit) return {};
  const Span content = object.content.first(object.count * unit);
  return allowance_.takeBytes(content.size()) ? contentOf(object.kind, content) : PlistValue();
}

PlistValue Reader::key(std::uint64_t number) {
  const auto object = binaryObjectIn(table_.objectAt(number));
  return object && object->isString() && allowance_.takeValues(1) ? counted(*object) : PlistValue();
}

PlistValue Reader::array(const BinaryObject& object, int level) {
  if (!holds(object, 1)) return {};
  const auto elements = PlistArray::make();
  for (std::size_t place = 0; place < object.count; ++place) {
    PlistValue element = value(reference(object.content, place), level);
    if (element.isAbsent()) return {};
    elements->append(std::move(element));
  }
  return elements;
}

// All references to keys stand before all references to values.
PlistValue Reader::dictionary(const BinaryObject& object, int level) {
  if (object.count > plistLimits::dictionaryEntries || !holds(object, 2)) return {};
  const auto entries = PlistDictionary::make();
  for (std::size_t place = 0; place < object.count; ++place) {
    const PlistValue name = key(reference(object.content, place));
    if (name.isAbsent()) return {};
    PlistValue entry = value(reference(object.content, object.count + place), level);
    if (entry.isAbsent()) return {};
    entries->set(*name.string(), std::move(entry));
  }
  return entries;
}

}  // namespace

std::optional<PlistValue> readBinaryPlist(Span document) {
  const std::size_t magicSize = std::strlen(binaryPlistMagic);
  if (document.size() > plistLimits::documentBytes || document.size() < magicSize) return std::nullopt;
  if (std::memcmp(document.data(), binaryPlistMagic, magicSize) != 0) return std::nullopt;
  const auto table = BinaryTable::read(document);
  if (!table) return std::nullopt;
  PlistValue value = Reader(*table).value(table->top(), 0);
  if (value.isAbsent()) return std::nullopt;
  return value;
}

}  // namespace kelvasi
