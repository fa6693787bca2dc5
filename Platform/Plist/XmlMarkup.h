// SPDX-License-Identifier: Apache-2.0
// The markup around the values of an XML property list.
#pragma once

#include <string_view>

namespace kelvasi {

// Whether an attribute of the plist element is one that it may have.
bool isPlistVersion(std::string_view attribute, std::string_view value);
// Whether a comment is one that all readers take for the same (XML 1.0, section 2.5).
bool isPlainComment(std::string_view text);
// Whether what follows "<!DOCTYPE" declares nothing itself.
bool isPlainDoctype(std::string_view text);
// Whether an encoding is UTF-8.
bool isPlainEncoding(std::string_view name);
// Whether readers agree on where a processing instruction ends.
bool isPlainInstruction(std::string_view text);

}  // namespace kelvasi
