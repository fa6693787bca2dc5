// SPDX-License-Identifier: Apache-2.0
// Whole files, read and written at once.
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <optional>
#include <span>
#include <string>

#include "Plist/PlistValue.h"

namespace kelvasi {

// What went wrong, for people: "drive.pcap: No such file or directory". Nothing when all went well.
using FileError = std::optional<std::string>;

struct FileContents {
  Bytes bytes;  // empty after an error
  FileError error;
};

// Reads to the end of the file, which may be a pipe. A file of more than `limit` bytes is an error.
FileContents readFile(const std::string& path, std::size_t limit = std::numeric_limits<std::size_t>::max());

// What is written is its owner's alone (0600), whatever the umask and whatever it replaces. Symbolic links
// are followed. What exists and is no regular file, such as a pipe or a device, is written into and stays as
// it is.

// Creates the file straight at its path, or replaces what is there as replaceFile() does. After an error the
// name has what it had before.
FileError writeFile(const std::string& path, std::span<const std::uint8_t> bytes);

// Puts a file in the place of the one of that name, if any. The name always has a whole file, the old or the
// new, even if the machine stops; after an error it is the old.
FileError replaceFile(const std::string& path, std::span<const std::uint8_t> bytes);

}  // namespace kelvasi
