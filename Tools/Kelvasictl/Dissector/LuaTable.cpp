// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/LuaTable.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdio>

namespace kelvasi {

namespace {

// Lua reads a backslash and three decimal digits as a byte.
std::string escaped(char character) {
  std::array<char, 8> digits;
  const int length =
      std::snprintf(digits.data(), digits.size(), "\\%03u", static_cast<unsigned char>(character));
  return {digits.data(), static_cast<std::size_t>(length)};
}

bool isName(std::string_view key) {
  const auto isLetter = [](char each) { return each == '_' || (each >= 'a' && each <= 'z'); };
  return !key.empty() && std::ranges::all_of(key, isLetter);
}

}  // namespace

std::string luaString(std::string_view text) {
  std::string quoted = "\"";
  for (const char each : text) {
    const bool isPlain = static_cast<unsigned char>(each) >= ' ' && each != '"' && each != '\\';
    quoted += isPlain ? std::string(1, each) : escaped(each);
  }
  return quoted + '"';
}

std::string luaNumber(double number) {
  std::array<char, 32> digits;
  return {digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr};
}

void LuaTable::begin() {
  if (!members_.empty() && members_.back() != '\n') members_ += ", ";
}

LuaTable& LuaTable::add(std::string_view written) {
  begin();
  members_ += written;
  return *this;
}

LuaTable& LuaTable::set(std::string_view key, std::string_view written) {
  begin();
  members_ += isName(key) ? std::string(key) : "[" + luaString(key) + "]";
  (members_ += " = ") += written;
  return *this;
}

LuaTable& LuaTable::setText(std::string_view key, std::string_view text) {
  return text.empty() ? *this : set(key, luaString(text));
}

LuaTable& LuaTable::setNumber(std::string_view key, double number) {
  return number == 0 ? *this : set(key, luaNumber(number));
}

LuaTable& LuaTable::setFlag(std::string_view key, bool isSet) {
  return isSet ? set(key, "true") : *this;
}

LuaTable& LuaTable::breakLine() {
  members_ += members_.empty() ? "\n" : ",\n";
  return *this;
}

}  // namespace kelvasi
