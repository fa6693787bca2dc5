// SPDX-License-Identifier: Apache-2.0
// What the elements of an XML property list that hold no others contain. Each gives nothing for a text that
// is no such value, white space around it aside.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

// A decimal or hexadecimal number from -2^63 to 2^64 - 1. Leading zeros, octal to some readers, are refused.
std::optional<PlistValue> xmlInteger(std::string_view text);
// A decimal number, an infinity or "nan"; one too large for a double is an infinity.
std::optional<PlistValue> xmlReal(std::string_view text);
// As in 2024-03-05T14:07:09Z.
std::optional<PlistValue> xmlDate(std::string_view text);
// Base64, white space anywhere.
std::optional<PlistValue> xmlData(std::string_view text);

// Appends a text with its references resolved: to characters and to XML's own five entities only, none of
// them NUL. False where it holds another.
bool appendXmlText(std::string& whole, std::string_view text);

// The text without the white space around it.
std::string_view trimmed(std::string_view text);

}  // namespace kelvasi
