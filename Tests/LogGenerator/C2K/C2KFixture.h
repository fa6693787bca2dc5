// SPDX-License-Identifier: Apache-2.0
// A CDMA generator with a template of one leaf per lookup name, each called after it.
#pragma once

#include <initializer_list>
#include <span>
#include <string>

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi::test {

struct C2KFixture {
  explicit C2KFixture(std::initializer_list<std::string_view> names)
      : C2KFixture(std::span(names.begin(), names.size())) {}
  explicit C2KFixture(std::span<const std::string_view> names) {
    const auto leaves = PlistDictionary::make();
    for (const std::string_view name : names) leaves->set(name, name);
    useTemplate(leaves);
  }
  void useTemplate(PlistValue value) {
    surroundings.resources.files["C2KTemplate.plist"] = surroundings.plists.standFor(value);
  }

  void take(const Bytes& message) { generator.updateState(state, message); }
  PlistValue shown(std::string_view name) const { return state.find("Display")->dictionary()->get(name); }
  std::string text(std::string_view name) const { return asText(shown(name)); }
  std::string display() const { return asText(*state.find("Display")); }
  PlistValue extraInfo(std::string_view key) const { return state.find("ExtraInfo")->dictionary()->get(key); }
  std::vector<std::string> errors() const { return surroundings.log.errors(); }
  std::vector<std::string> warnings() const { return surroundings.log.warnings(); }

  TestPlatform surroundings;
  C2KLogGenerator generator{surroundings.platform()};
  PlistDictionary state;
};

// Writes `digits` over a record from byte `at` on.
inline Bytes with(Bytes bytes, std::size_t at, std::string_view digits) {
  const Bytes patch = hex(digits);
  for (std::size_t place = 0; place < patch.size(); ++place) bytes.at(at + place) = patch[place];
  return bytes;
}

}  // namespace kelvasi::test
