// SPDX-License-Identifier: Apache-2.0
// XML property lists, read into values.
#pragma once

#include <optional>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

// Nothing for a document that is not one property list in UTF-8, is beyond PlistLimits.h, declares entities
// of its own, or holds something that readers differ on. While it is read it takes at most some ten times its
// size in memory.
std::optional<PlistValue> readXmlPlist(std::string_view document);
// The same, written over a value as PlistSerialiser::parseOver does.
bool readXmlPlist(std::string_view document, PlistValue& value);

}  // namespace kelvasi
