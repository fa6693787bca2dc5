// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KLookup.h"

#include <algorithm>
#include <set>

namespace kelvasi {

namespace {

using Sections = std::set<const PlistDictionary*>;

void collectSections(const PlistValue& display, Sections& sections) {
  const PlistDictionary* entries = display.dictionary();
  if (!entries || !sections.insert(entries).second) return;
  for (const auto& [key, value] : *entries) collectSections(value, sections);
}

bool isIn(const PlistValue& leaf, const Sections& sections) {
  const PlistValue* section = leaf.dictionary() ? leaf.dictionary()->find("dict") : nullptr;
  return section && sections.contains(section->dictionary());
}

}  // namespace

bool leadsInto(const PlistValue& display, const PlistDictionary& lookup) {
  Sections sections;
  collectSections(display, sections);
  return std::ranges::all_of(lookup, [&sections](const auto& name) {
    const PlistArray* leaves = name.second.array();
    return leaves &&
           std::ranges::all_of(*leaves, [&](const PlistValue& leaf) { return isIn(leaf, sections); });
  });
}

}  // namespace kelvasi
