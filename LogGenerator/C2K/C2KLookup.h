// The CDMA display is addressed by lookup names: the template says which leaves of the display each name
// fills.
#pragma once

#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

// Gives every leaf of the name its value. A name that the template does not use is dropped; an entry that is
// not whole ends the name's turn.
void setByLookup(std::string_view name, const PlistValue& value, const PlistDictionary& lookup);

// Whether every leaf that the lookup table knows is in a dictionary of this display.
bool leadsInto(const PlistValue& display, const PlistDictionary& lookup);

}  // namespace kelvasi
