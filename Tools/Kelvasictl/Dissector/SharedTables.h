// SPDX-License-Identifier: Apache-2.0
// What several rows of the dissector refer to by number: texts, layouts and lists, each written once.
#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/RecordLayout.h"
#include "Tools/Kelvasictl/Dissector/LuaTable.h"

namespace kelvasi {

// name, byte, bit, width, whether signed, whether big-endian
std::string luaField(const Field& field);

// Numbers begin at 1; an empty table has none and is 0.
class SharedTables {
 public:
  std::size_t texts(std::span<const std::string_view> texts);
  std::size_t layout(std::span<const Field> layout);
  std::size_t list(const EntryList& list);

  // The definitions, `tables.texts` and so on.
  std::string written() const;

 private:
  using Kind = std::vector<std::string>;

  static std::size_t numberOf(Kind& kind, const LuaTable& table);

  Kind texts_;
  Kind layouts_;
  Kind lists_;
};

}  // namespace kelvasi
