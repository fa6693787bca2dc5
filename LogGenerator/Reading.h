// SPDX-License-Identifier: Apache-2.0
// A reading: a row of the display and its raw value, as one message wrote it. Number, unit, state and text
// are functions of the two.
//
// Readings are gathered message by message (Readings.h). What they refer to lasts until the next message.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"
#include "Radio/CellIdentity.h"
#include "Radio/Quantity.h"

namespace kelvasi {

struct Row;

// What the cells of a section are to the handset.
enum class CellRole : std::uint8_t { none, serving, active, neighbour, candidate };

constexpr std::string_view nameOf(CellRole role) {
  constexpr std::array<std::string_view, 5> names{"none", "serving", "active", "neighbour", "candidate"};
  return names[static_cast<std::size_t>(role)];
}

// A section of the display that rows are written into.
struct ReadingSection {
  std::string name = {};
  std::string path = {};  // the JSON pointer (RFC 6901) to it in the display
  CellRole role = CellRole::none;
};

struct Reading {
  enum class Kind : std::uint8_t {
    row,      // `row` and `raw` say what was written
    value,    // `value` was put there as it came; where its name tells what it is, `row` and `raw` say so
    removal,  // what stood there went, and all below it
  };
  enum class Key : std::uint8_t {
    row,      // `key` names the row
    element,  // `key` names an element of `list`, which is the row
    path,     // `key` is a path on from the section, escaped already, and `list` the row
  };
  static constexpr std::int32_t notInList = -1;

  Kind kind = Kind::row;
  Key keyKind = Key::row;
  std::int32_t entry = notInList;           // the place in the section, where that is a list
  std::int32_t element = notInList;         // the place in the list inside the section
  const ReadingSection* section = nullptr;  // null: the display as a whole
  const Row* row = nullptr;                 // what `raw` is
  std::int64_t raw = 0;
  std::string_view list = {};  // the row that holds a list, where the reading is in one
  std::string_view key = {};
  const PlistValue* value = nullptr;  // of kind `value` only: no container but an empty one, or any array
  CellIdentity cell = {};
};

// What the reading's row or value is; null for a removal.
const Quantity* quantityOf(const Reading& reading);
// In the quantity's unit, a state's raw number; nothing for a text, for a value that stands for "none", and
// for what is not finite.
std::optional<double> numberOf(const Reading& reading);
// As the display shows it; nothing for a removal. A value that is no string is written out: "[]" and "{}",
// numbers and dates as JSON has them, "true", "false", and data in base 64.
std::optional<std::string> textOf(const Reading& reading);
// The key of the row; empty for the removal of an entry, a section or everything.
std::string_view rowOf(const Reading& reading);

// The JSON pointer to what was written or removed; empty for the display as a whole.
void appendPath(std::string& to, const Reading& reading);
std::string pathOf(const Reading& reading);
// One step of such a pointer, its "~" and "/" escaped.
void appendPathStep(std::string& to, std::string_view step);

}  // namespace kelvasi
