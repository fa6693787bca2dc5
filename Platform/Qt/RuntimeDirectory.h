// SPDX-License-Identifier: Apache-2.0
// The private directory in which the sockets of one user meet.
#pragma once

#include <sys/un.h>

#include <optional>
#include <string>
#include <string_view>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

class SystemLog;

class RuntimeDirectory {
 public:
  // $TELVON_RUNTIME_DIR, else $XDG_RUNTIME_DIR/telvon; an empty variable counts as not set. Made (mode 0700)
  // when it is not there. Nothing, and one error line that says why, unless it is an absolute path to a
  // directory, not a symbolic link, of the current user's, with mode 0700.
  static std::optional<RuntimeDirectory> open(SystemLog& log);

  // Where open() looks, and why it would refuse that, in words that follow the path; empty when it would not.
  struct Place {
    std::string path;
    std::string fault;
  };
  static Place look();

  const std::string& path() const { return path_; }

  // Where the socket of this name is. Nothing, and one error line, when the name is empty, begins with a dot,
  // holds a slash or a control character, or makes too long a path.
  std::optional<sockaddr_un> addressOf(std::string_view name, SystemLog& log) const;

  // Held by whoever makes or removes a socket here, released with the descriptor. An empty one, and one error
  // line, when another process keeps it for over a second.
  FileDescriptor lock(SystemLog& log) const;

 private:
  explicit RuntimeDirectory(std::string path) : path_(std::move(path)) {}

  std::string path_;
};

}  // namespace kelvasi
