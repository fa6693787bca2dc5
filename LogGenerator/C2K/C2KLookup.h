// SPDX-License-Identifier: Apache-2.0
// The CDMA display is addressed by lookup names: the template says which leaves of the display each name
// fills.
#pragma once

#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

// Calls `fill` with the dictionary and the key of every leaf of the name. A name that the template does not
// use is dropped; an entry that is not whole ends the name's turn.
template <typename Fill>
void forEachLeaf(std::string_view name, const PlistDictionary& lookup, const Fill& fill) {
  const PlistValue* entries = lookup.find(name);
  if (!entries || !entries->array()) return;
  for (const PlistValue& entry : *entries->array()) {
    const PlistDictionary* leaf = entry.dictionary();
    const PlistValue* display = leaf ? leaf->find("dict") : nullptr;
    const PlistValue* key = leaf ? leaf->find("key") : nullptr;
    if (!display || !display->dictionary() || !key || !key->string()) return;
    fill(*display->dictionary(), *key->string());
  }
}

// Whether every leaf that the lookup table knows is in a dictionary of this display.
bool leadsInto(const PlistValue& display, const PlistDictionary& lookup);

}  // namespace kelvasi
