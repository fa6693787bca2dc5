// The CDMA display is addressed by lookup names: the template says which leaf of the display each name fills.
#pragma once

#include <string_view>

#include "Platform/SystemLog.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// Walks a template into `display`, a dictionary, with empty leaves, and into a lookup table: a name to the
// entries ("key" and "dict") of the leaves that it fills, in the order of the walk.
void fillFromTemplate(const PlistDictionary& displayTemplate, const PlistValue& display,
                      PlistDictionary& lookup, SystemLog& log);

// Gives every leaf of the name its value. A name that the template does not use is dropped; an entry that is
// not whole ends the name's turn.
void setByLookup(std::string_view name, const PlistValue& value, const PlistDictionary& lookup);

}  // namespace kelvasi
