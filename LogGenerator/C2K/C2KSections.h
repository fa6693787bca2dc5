// SPDX-License-Identifier: Apache-2.0
// Where the dictionaries of a CDMA display stand, for the readings of what is written into them.
#pragma once

#include <deque>
#include <string>

#include "LogGenerator/Reading.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class C2KSections {
 public:
  // Once for each display; a display that is known already costs a comparison.
  void learn(const PlistValue& display);
  // Null for a dictionary that was not part of the display.
  const ReadingSection* find(const PlistDictionary* dictionary) const;

 private:
  void add(const PlistDictionary& dictionary, ReadingSection section);

  struct Entry {
    const PlistDictionary* dictionary;
    ReadingSection section;
  };
  PlistValue display_;
  std::deque<Entry> entries_;
};

}  // namespace kelvasi
