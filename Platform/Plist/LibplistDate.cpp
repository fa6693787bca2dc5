// SPDX-License-Identifier: Apache-2.0
// A date goes through a binary document that holds nothing else, where it is a double.
#include <array>
#include <bit>

#include "Platform/Plist/LibplistNode.h"

namespace kelvasi {

namespace {

constexpr double from1970To2001 = 978307200;
constexpr std::size_t datePlace = 8;  // after the magic
constexpr std::size_t dateSize = 9;   // the object's kind and a double

constexpr std::array<std::uint8_t, 50> emptyDate{
    'b',       'p', 'l', 'i', 's', 't', '0', '0',  //
    0x33,      0,   0,   0,   0,   0,   0,   0,
    0,                                           // the date
    datePlace,                                   // table of offsets
    0,         0,   0,   0,   0,   0,   1,   1,  // trailer: sizes of an offset and of a reference
    0,         0,   0,   0,   0,   0,   0,   1,  // objects
    0,         0,   0,   0,   0,   0,   0,   0,  // the top one
    0,         0,   0,   0,   0,   0,   0,   datePlace + dateSize};

}  // namespace

LibplistNode dateToLibplist(PlistDate date) {
  std::array<std::uint8_t, emptyDate.size()> document = emptyDate;
  auto bits = std::bit_cast<std::uint64_t>(date.secondsSince1970 - from1970To2001);
  for (std::size_t place = datePlace + 8; place > datePlace; --place, bits >>= 8) {
    document[place] = static_cast<std::uint8_t>(bits & 0xff);
  }
  plist_t node = nullptr;
  plist_from_bin(reinterpret_cast<const char*>(document.data()), document.size(), &node);
  return LibplistNode(node);
}

}  // namespace kelvasi
