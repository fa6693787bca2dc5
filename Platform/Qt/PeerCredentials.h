// SPDX-License-Identifier: Apache-2.0
// Who is at the other end of a Unix-domain socket.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string_view>

namespace kelvasi {

class SystemLog;

// Whom a connection may lead to.
struct AllowedPeers {
  bool ofThisUser = true;        // the process's effective one
  std::optional<gid_t> ofGroup;  // nothing: no other user
};

// Whether the peer is one of these; an error line with `name` says so when it is not, or cannot be told.
bool isPeerAllowed(int socket, const AllowedPeers& allowed, std::string_view name, SystemLog& log);

}  // namespace kelvasi
