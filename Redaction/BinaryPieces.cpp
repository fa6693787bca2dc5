// SPDX-License-Identifier: Apache-2.0
// A walk over the objects of a binary property list, each as often as it is referred to.
#include <optional>

#include "Redaction/PlistPieces.h"

namespace kelvasi {

namespace {

constexpr std::size_t magicSize = 8;
constexpr std::size_t trailerSize = 32;
constexpr std::size_t mostLevels = 128;
constexpr std::size_t mostObjects = 2'000'000;

enum Kind : unsigned {
  integer = 1,
  real = 2,
  date = 3,
  data = 4,
  ascii = 5,
  utf16 = 6,
  array = 0xA,
  dictionary = 0xD
};

std::uint64_t bigEndian(std::span<const std::uint8_t> bytes) {
  std::uint64_t number = 0;
  for (const std::uint8_t byte : bytes) number = number << 8 | byte;
  return number;
}

struct Object {
  unsigned kind = 0;
  std::uint64_t count = 0;
  std::size_t content = 0;  // where it begins
  std::size_t size = 0;     // of the content, in bytes
};

class Walk {
 public:
  Walk(std::span<std::uint8_t> document, const TakePiece& take) : document_(document), take_(take) {}

  bool run() {
    if (document_.size() < magicSize + trailerSize) return false;
    const auto trailer = document_.last(trailerSize);
    offsetSize_ = trailer[6];
    referenceSize_ = trailer[7];
    count_ = bigEndian(trailer.subspan(8, 8));
    table_ = bigEndian(trailer.subspan(24, 8));
    if (!isNumberSize(offsetSize_) || !isNumberSize(referenceSize_)) return false;
    if (table_ <= magicSize || table_ > document_.size() - trailerSize) return false;
    if (count_ > (document_.size() - trailerSize - table_) / offsetSize_) return false;
    isUsed_.assign(table_, false);
    if (!value(bigEndian(trailer.subspan(16, 8)))) return false;
    giveUnused();
    return true;
  }

 private:
  static bool isNumberSize(std::size_t size) { return size >= 1 && size <= 8; }

  std::optional<Object> objectAt(std::uint64_t number) {
    if (number >= count_) return std::nullopt;
    const std::uint64_t at = bigEndian(document_.subspan(table_ + number * offsetSize_, offsetSize_));
    if (at < magicSize || at >= table_) return std::nullopt;
    const unsigned marker = document_[at];
    Object object{.kind = marker >> 4, .count = marker & 0xF, .content = at + 1};
    if (object.kind >= data && object.count == 0xF && !takeCount(object)) return std::nullopt;
    object.size = sizeOf(object);
    if (object.size > table_ - object.content) return std::nullopt;
    for (std::size_t byte = at; byte < object.content + object.size; ++byte) isUsed_[byte] = true;
    return object;
  }

  // The count of a long object is an integer of its own.
  bool takeCount(Object& object) const {
    if (object.content >= table_ || document_[object.content] >> 4u != integer) return false;
    const std::size_t size = std::size_t{1} << (document_[object.content] & 0xFu);
    if (size > 8 || size >= table_ - object.content) return false;
    object.count = bigEndian(document_.subspan(object.content + 1, size));
    object.content += 1 + size;
    return object.count <= document_.size();
  }

  std::size_t sizeOf(const Object& object) const {
    switch (object.kind) {
      case integer:
      case real:
      case date:
        return std::size_t{1} << object.count;
      case data:
      case ascii:
        return object.count;
      case utf16:
        return 2 * object.count;
      case array:
        return referenceSize_ * object.count;
      case dictionary:
        return 2 * referenceSize_ * object.count;
      default:
        return 0;
    }
  }

  std::uint64_t reference(const Object& object, std::size_t place) const {
    return bigEndian(document_.subspan(object.content + place * referenceSize_, referenceSize_));
  }

  bool value(std::uint64_t number) {
    const auto object = objectAt(number);
    if (!object || ++seen_ > mostObjects || path_.size() > mostLevels) return false;
    if (object->kind == array || object->kind == dictionary) return container(*object);
    give(*object);
    return true;
  }

  bool container(const Object& object) {
    path_.emplace_back();
    for (std::size_t place = 0; place < object.count; ++place) {
      if (object.kind == dictionary && !key(reference(object, place))) return false;
      const std::size_t values = object.kind == dictionary ? object.count : 0;
      if (!value(reference(object, values + place))) return false;
    }
    path_.pop_back();
    return true;
  }

  // Of a key beyond ASCII the low bytes: no name that is known has such.
  bool key(std::uint64_t number) {
    const auto object = objectAt(number);
    if (!object || (object->kind != ascii && object->kind != utf16)) return false;
    const auto bytes = document_.subspan(object->content, object->size);
    path_.back().clear();
    const std::size_t step = object->kind == utf16 ? 2 : 1;
    for (std::size_t at = step - 1; at < bytes.size(); at += step)
      path_.back() += static_cast<char>(bytes[at]);
    return true;
  }

  void give(const Object& object) {
    using Form = PlistPiece::Form;
    const auto bytes = document_.subspan(object.content, object.size);
    if (object.kind == integer || object.kind == data)
      take_({Form::binary, path_, bytes, object.kind == data});
    if (object.kind == ascii) take_({Form::text, path_, bytes});
    if (object.kind == utf16) take_({Form::utf16, path_, bytes});
    if (object.kind == real || object.kind == date) take_({Form::moment, path_, bytes});
  }

  void giveUnused() {
    for (std::size_t at = magicSize; at < table_; ++at) {
      const std::size_t begin = at;
      while (at < table_ && !isUsed_[at]) ++at;
      if (begin < at) take_({PlistPiece::Form::aside, {}, document_.subspan(begin, at - begin)});
    }
  }

  std::span<std::uint8_t> document_;
  const TakePiece& take_;
  std::size_t offsetSize_ = 1;
  std::size_t referenceSize_ = 1;
  std::uint64_t count_ = 0;
  std::uint64_t table_ = 0;  // where the table of offsets begins
  std::size_t seen_ = 0;
  std::vector<bool> isUsed_;
  std::vector<std::string> path_;
};

}  // namespace

bool forEachBinaryPiece(std::span<std::uint8_t> document, const TakePiece& take) {
  return Walk(document, take).run();
}

}  // namespace kelvasi
