// SPDX-License-Identifier: Apache-2.0
// What decoding throws. Nothing catches the two record exceptions: a throw ends the process.
#pragma once

#include <exception>
#include <stdexcept>
#include <string>

namespace kelvasi {

// An element index at or past the element count that the record itself states.
class ArrayOutOfBoundsException : public std::exception {
 public:
  const char* what() const noexcept override { return "element index at or past the record's own count"; }
};

namespace LogCode_0xFF000020 {
// A SIM-file payload that is not a property list.
class UnknownDataException {};
}  // namespace LogCode_0xFF000020

// An assertion about what came in does not hold. Nothing catches it either.
class AssertionFailure : public std::logic_error {
 public:
  AssertionFailure(const std::string& source, const std::string& text)
      : std::logic_error(text + " (assertion in " + source + ")") {}
};

// An operation that every subclass overrides was called on the base class.
class UnimplementedMethodError : public std::logic_error {
 public:
  using std::logic_error::logic_error;
};

}  // namespace kelvasi
