// SPDX-License-Identifier: Apache-2.0
// What a piece of a property list says, and another in its place that is as long.
#pragma once

#include <optional>
#include <string>

#include "Plist/PlistValue.h"
#include "Redaction/PlistPieces.h"
#include "Redaction/Replacement.h"

namespace kelvasi {

// A text; of UTF-16 with a "\x80" for what is not ASCII. Empty for other forms.
std::string textIn(const PlistPiece& piece);
// A number in digits or an integer's bytes. Nothing for other forms, and for what is no number without sign.
std::optional<std::uint64_t> numberIn(const PlistPiece& piece);
// Data. Empty for other forms.
Bytes dataIn(const PlistPiece& piece);

// Each writes what is exactly as long.
void writeText(const PlistPiece& piece, std::string_view text);
// At the end of the digits' place, white space before it.
void writeNumber(const PlistPiece& piece, std::uint64_t number);
void writeData(const PlistPiece& piece, std::span<const std::uint8_t> data);

}  // namespace kelvasi
