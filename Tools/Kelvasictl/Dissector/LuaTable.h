// SPDX-License-Identifier: Apache-2.0
// A table of Lua in writing: members in the order in which they were added.
#pragma once

#include <string>
#include <string_view>

namespace kelvasi {

std::string luaString(std::string_view text);
// The shortest that reads back as the same number.
std::string luaNumber(double number);

class LuaTable {
 public:
  LuaTable& add(std::string_view written);  // an element of the list part
  LuaTable& addText(std::string_view text) { return add(luaString(text)); }
  LuaTable& addNumber(double number) { return add(luaNumber(number)); }

  LuaTable& set(std::string_view key, std::string_view written);
  // Each leaves out what is empty, zero or false, which Lua's nil stands for.
  LuaTable& setText(std::string_view key, std::string_view text);
  LuaTable& setNumber(std::string_view key, double number);
  LuaTable& setFlag(std::string_view key, bool isSet);

  bool empty() const { return members_.empty(); }
  std::string written() const { return "{" + members_ + "}"; }
  // A member a line, for tables of tables.
  LuaTable& breakLine();

 private:
  void begin();

  std::string members_;
};

}  // namespace kelvasi
