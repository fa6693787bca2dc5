// Whether an XML property list is well formed and within bounds.
#pragma once

#include <string_view>

namespace kelvasi {

// True for UTF-8 documents within PlistLimits.h whose elements and texts are those of a property list.
// Refused besides: a document type with declarations of its own, attributes other than plist's version,
// texts with NUL, and scalars XmlScalars.h refuses.
bool isSafeXmlPlist(std::string_view document);

}  // namespace kelvasi
