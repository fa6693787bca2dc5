// SPDX-License-Identifier: Apache-2.0
// A file that grows piece by piece: each piece is in it whole or not at all, and the system has it when the
// call returns. It is its owner's alone (0600), as far as this class has made it.
#pragma once

#include <cstdint>
#include <span>
#include <string>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Posix/Files.h"

namespace kelvasi {

class OutputFile {
 public:
  // What becomes of a regular file that is there already. A pipe or a device is written into in any case.
  enum class Existing { stays, isReplaced };

  // "-" is the standard output. `stays` makes an existing file an error; with `isReplaced` the new one grows
  // beside it until publish(). Symbolic links are followed.
  OutputFile(const std::string& path, Existing existing);
  // A file that was made here and not published is removed.
  ~OutputFile();
  OutputFile(const OutputFile&) = delete;
  OutputFile& operator=(const OutputFile&) = delete;

  // False, and error() set, when it could not be written. A file on a disk then ends where it ended before.
  // After an error nothing is written any more.
  bool append(std::span<const std::uint8_t> piece);
  // From now on the file is there to stay, in the place of the older one. False, and error() set, on failure.
  bool publish();
  // Returns when a file is on its disk. False, and error() set, when it may not be. Nothing follows.
  bool close();

  // Whether an older file has its place until publish().
  bool hasOlder() const { return !temporary_.empty(); }
  const FileError& error() const { return error_; }

 private:
  FileDescriptor open(const std::string& path, Existing existing);
  bool fail();

  std::string name_;
  std::string target_;     // behind the symbolic links
  std::string temporary_;  // empty: written in its place
  FileDescriptor file_;
  bool isMade_;  // here, and not published
  FileError error_;
};

}  // namespace kelvasi
