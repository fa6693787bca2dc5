// What the elements of an XML property list that hold no others may contain. The library takes whatever it
// finds there for some value or other: letters for 0, the 30th of February for the 1st of March.
#pragma once

#include <string_view>

namespace kelvasi {

// A decimal or hexadecimal number from -2^63 to 2^64 - 1. Leading zeros, octal to the library, are refused.
bool isXmlInteger(std::string_view text);
// A decimal number, an infinity or "nan".
bool isXmlReal(std::string_view text);
// As in 2024-03-05T14:07:09Z.
bool isXmlDate(std::string_view text);
// Base64, white space anywhere.
bool isXmlData(std::string_view text);
// Texts refer to characters and to XML's own five entities only; no reference yields NUL.
bool isXmlString(std::string_view text);

}  // namespace kelvasi
