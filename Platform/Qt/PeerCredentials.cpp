// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/PeerCredentials.h"

#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "Platform/Qt/AccessGroup.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

bool isPeerAllowed(int socket, const AllowedPeers& allowed, std::string_view name, SystemLog& log) {
  ucred peer{};
  socklen_t size = sizeof peer;
  const int nameLength = static_cast<int>(name.size());
  if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0) {
    log.print(LogPriority::error, "%.*s: cannot tell whose the peer is (%s); connection closed", nameLength,
              name.data(), std::strerror(errno));
    return false;
  }
  const bool isOfThisUser = peer.uid == ::geteuid();
  if (allowed.ofThisUser && isOfThisUser) return true;
  if (allowed.ofGroup && !isOfThisUser && isPeerInGroup(socket, *allowed.ofGroup)) return true;
  log.print(LogPriority::error, "%.*s: peer (pid %ld) is of %s user (uid %lu)%s; connection closed",
            nameLength, name.data(), static_cast<long>(peer.pid), isOfThisUser ? "this" : "another",
            static_cast<unsigned long>(peer.uid),
            allowed.ofGroup && !isOfThisUser ? " and not in the group of TELVON_GROUP" : "");
  return false;
}

}  // namespace kelvasi
