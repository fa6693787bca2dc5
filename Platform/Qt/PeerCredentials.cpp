// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/PeerCredentials.h"

#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "Platform/SystemLog.h"

namespace kelvasi {

bool isPeerOfThisUser(int socket, std::string_view name, SystemLog& log) {
  ucred peer{};
  socklen_t size = sizeof peer;
  const int nameLength = static_cast<int>(name.size());
  if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0) {
    log.print(LogPriority::error, "%.*s: cannot tell whose the peer is (%s); connection closed", nameLength,
              name.data(), std::strerror(errno));
    return false;
  }
  if (peer.uid == ::geteuid()) return true;
  log.print(LogPriority::error, "%.*s: peer (pid %ld) is of another user (uid %lu); connection closed",
            nameLength, name.data(), static_cast<long>(peer.pid), static_cast<unsigned long>(peer.uid));
  return false;
}

}  // namespace kelvasi
