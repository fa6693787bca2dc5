// Keys that are written as an empty tag, which the library does not know.
#pragma once

#include <string>
#include <string_view>

namespace kelvasi {

// False when there is surely none in the document.
bool mayHaveEmptyKeys(std::string_view document);

// The same document with a start and an end tag for each.
std::string withEmptyKeysOpened(std::string_view document);

}  // namespace kelvasi
