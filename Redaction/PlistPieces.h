// SPDX-License-Identifier: Apache-2.0
// The bytes of a property list's values where they stand, to be written over by as many others.
#pragma once

#include <cstdint>
#include <functional>
#include <span>
#include <string>
#include <vector>

namespace kelvasi {

// A value, or a part of one that comments cut in pieces.
struct PlistPiece {
  enum class Form {
    text,     // UTF-8, with the references of XML
    utf16,    // big-endian
    decimal,  // a number in digits
    base64,   // with white space between
    binary,   // an integer or data as its bytes are
    moment,   // a date or a real number, in whatever form
    aside,    // of no value: a comment, or bytes that nothing refers to
  };
  Form form;
  std::span<const std::string> path;  // the keys on the way; empty for an element of an array
  std::span<std::uint8_t> bytes;
  bool isData = false;  // and not an integer
};

using TakePiece = std::function<void(const PlistPiece& piece)>;

// Gives every value. False when this is no property list as far as it was read.
bool forEachPiece(std::span<std::uint8_t> document, const TakePiece& take);

bool forEachXmlPiece(std::span<std::uint8_t> document, const TakePiece& take);
bool forEachBinaryPiece(std::span<std::uint8_t> document, const TakePiece& take);

}  // namespace kelvasi
