#include "Platform/Plist/BinaryGuard.h"

#include <cstring>

#include "Platform/Plist/Allowance.h"
#include "Platform/Plist/BinaryObject.h"
#include "Platform/Plist/BinaryTable.h"
#include "Platform/Plist/PlistLimits.h"

namespace kelvasi {

namespace {

using Span = std::span<const std::uint8_t>;

class Guard {
 public:
  explicit Guard(const BinaryTable& table) : table_(table) {}
  bool value(std::uint64_t number, int level);

 private:
  bool blob(const BinaryObject& object);
  bool container(const BinaryObject& object, int level);
  bool key(std::uint64_t number);
  std::uint64_t reference(Span references, std::size_t place) const;

  const BinaryTable& table_;
  Allowance allowance_{plistLimits::values, plistLimits::contentBytes};
};

std::uint64_t Guard::reference(Span references, std::size_t place) const {
  return bigEndian(references.subspan(place * table_.referenceSize(), table_.referenceSize()));
}

// `level` counts the containers around the value.
bool Guard::value(std::uint64_t number, int level) {
  const auto object = binaryObjectIn(table_.objectAt(number));
  if (!object || !allowance_.takeValues(1)) return false;
  if (object->kind == BinaryObject::array || object->kind == BinaryObject::dictionary) {
    return level < plistLimits::levels && container(*object, level + 1);
  }
  return object->isCounted() ? blob(*object) : isSafeScalar(*object);
}

bool Guard::blob(const BinaryObject& object) {
  const std::size_t unit = object.kind == BinaryObject::utf16 ? 2 : 1;
  if (object.count > object.content.size() / unit) return false;
  const Span content = object.content.first(object.count * unit);
  return allowance_.takeBytes(content.size()) && isSafeContent(object.kind, content);
}

bool Guard::key(std::uint64_t number) {
  const auto object = binaryObjectIn(table_.objectAt(number));
  return object && object->isString() && allowance_.takeValues(1) && blob(*object);
}

bool Guard::container(const BinaryObject& object, int level) {
  const bool keyed = object.kind == BinaryObject::dictionary;
  if (keyed && object.count > plistLimits::dictionaryEntries) return false;
  if (object.count > object.content.size() / table_.referenceSize() / (keyed ? 2 : 1)) return false;
  for (std::size_t place = 0; place < object.count; ++place) {
    if (keyed && !key(reference(object.content, place))) return false;
    if (!value(reference(object.content, keyed ? object.count + place : place), level)) return false;
  }
  return true;
}

}  // namespace

bool isSafeBinaryPlist(Span document) {
  const std::size_t magicSize = std::strlen(binaryPlistMagic);
  if (document.size() > plistLimits::documentBytes || document.size() < magicSize) return false;
  if (std::memcmp(document.data(), binaryPlistMagic, magicSize) != 0) return false;
  const auto table = BinaryTable::read(document);
  return table && Guard(*table).value(table->top(), 0);
}

}  // namespace kelvasi
