// SPDX-License-Identifier: Apache-2.0
// How packed files are unpacked: gzip (RFC 1952) and Zstandard (RFC 8878).
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>

namespace kelvasi {

class Unpacker {
 public:
  struct Step {
    std::size_t taken = 0;    // of the packed bytes
    std::size_t given = 0;    // into `out`
    bool isComplete = false;  // a packed stream ends here; another may follow
    std::string fault;        // not empty: the packed bytes behind those taken are none
  };

  virtual ~Unpacker() = default;
  // Neither taken nor given: more packed bytes are needed.
  virtual Step unpack(std::span<const std::uint8_t> packed, std::span<std::uint8_t> out) = 0;
  // "gzip"
  virtual const char* name() const = 0;
};

// For a file that begins with these bytes, four at least; null where it is not packed.
std::unique_ptr<Unpacker> unpackerFor(std::span<const std::uint8_t> beginning);

}  // namespace kelvasi
