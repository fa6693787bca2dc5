// What may stand around the elements of an XML property list. Readers differ on where odd markup ends, so a
// document is accepted only where they agree. Each text is the token's (see XmlTokens.h).
#pragma once

#include <string_view>

namespace kelvasi {

// The attributes of the plist element: none, or a version of the format.
bool isPlistVersion(std::string_view attributes);
bool isPlainComment(std::string_view text);
// A document type without declarations of its own.
bool isPlainDoctype(std::string_view text);
// The XML declaration may name no encoding but UTF-8.
bool isPlainInstruction(std::string_view text);

}  // namespace kelvasi
