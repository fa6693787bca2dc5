// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KSections.h"

#include <algorithm>

#include "LogGenerator/SortPrefix.h"

namespace kelvasi {

void C2KSections::learn(const PlistValue& display) {
  if (display.dictionary() == display_.dictionary()) return;
  entries_.clear();
  display_ = display;
  if (display.dictionary()) add(*display.dictionary(), {});
}

const ReadingSection* C2KSections::find(const PlistDictionary* dictionary) const {
  const auto entry = std::ranges::find(entries_, dictionary, &Entry::dictionary);
  return entry == entries_.end() ? nullptr : &entry->section;
}

void C2KSections::add(const PlistDictionary& dictionary, ReadingSection section) {
  for (const auto& [key, value] : dictionary) {
    if (!value.dictionary()) continue;
    ReadingSection nested{.name = std::string(withoutSortPrefix(key)), .path = section.path};
    appendPathStep(nested.path, key);
    add(*value.dictionary(), std::move(nested));
  }
  entries_.push_back({&dictionary, std::move(section)});
}

}  // namespace kelvasi
