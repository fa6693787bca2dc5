// SPDX-License-Identifier: Apache-2.0
// The directory in which sockets meet: those of one user or, where TELVON_GROUP names a group, of its users.
#pragma once

#include <sys/un.h>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Qt/PeerCredentials.h"

namespace kelvasi {

class SystemLog;

class RuntimeDirectory {
 public:
  // Of a group's directory a daemon has to be the owner, and makes it; applications wait until it is there.
  enum class Side { application, daemon };

  // $TELVON_RUNTIME_DIR, else $XDG_RUNTIME_DIR/telvon; an empty variable counts as not set. Made (mode 0700)
  // when it is not there. Nothing, and one error line that says why, unless it is an absolute path to a
  // directory, not a symbolic link, of the current user's, with mode 0700; of a group's the group has to be
  // that one and the mode 2750.
  static std::optional<RuntimeDirectory> open(SystemLog& log, Side side = Side::application);

  // Where open() looks, and why it would refuse that, in words that follow the path; empty when it would not.
  struct Place {
    std::string path;
    std::string fault;
  };
  static Place look(Side side = Side::application);

  const std::string& path() const { return path_; }
  // Where sockets are: the directory and, of a group, the room in it where others than its owner listen.
  std::vector<std::string> rooms() const;

  // Where the socket of this name is: in a room, where this process listens under it, and where it finds who
  // does. Nothing, and one error line, when the name is empty, begins with a dot, holds a slash or a control
  // character, or makes too long a path.
  static std::optional<sockaddr_un> addressIn(const std::string& room, std::string_view name, SystemLog& log);
  std::optional<sockaddr_un> addressToListen(std::string_view name, SystemLog& log) const;
  std::optional<sockaddr_un> addressToReach(std::string_view name, SystemLog& log) const;

  // Who may connect here, and who may be found at an address.
  AllowedPeers allowedCallers() const;
  AllowedPeers allowedAt(const sockaddr_un& address) const;
  // Lets those connect to a socket that may. Returns 0 or errno.
  int admitCallers(const sockaddr_un& address) const;

  // Held by whoever makes or removes a socket here, released with the descriptor. An empty one, and one error
  // line, when another process keeps it for over a second.
  FileDescriptor lock(SystemLog& log) const;

 private:
  RuntimeDirectory(std::string path, std::optional<gid_t> group);
  std::string guestRoom() const;
  bool isGuest() const { return group_ && !isOwner_; }

  std::string path_;
  std::optional<gid_t> group_;  // nothing: the directory is private
  bool isOwner_ = true;
};

}  // namespace kelvasi
