// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/DeadSockets.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <system_error>

#include "Platform/Qt/RuntimeDirectory.h"
#include "Platform/Qt/UnixSocket.h"

namespace kelvasi {

namespace {

constexpr std::chrono::milliseconds probeTimeout{1};

void removeDeadSocketsIn(const std::string& room, SystemLog& log) {
  std::error_code error;
  for (std::filesystem::directory_iterator file(room, error), end; !error && file != end;
       file.increment(error)) {
    if (!file->is_socket(error)) continue;
    if (const auto address = RuntimeDirectory::addressIn(room, file->path().filename().string(), log))
      removeIfDead(*address);
  }
}

}  // namespace

// Connections to a dead socket are refused; to one that merely does not answer they are not.
bool removeIfDead(const sockaddr_un& address) {
  struct stat found {};
  if (::lstat(address.sun_path, &found) != 0 || !S_ISSOCK(found.st_mode)) return false;
  const FileDescriptor probe = makeUnixSocket();
  if (!probe || connectWithin(probe, address, probeTimeout) != ECONNREFUSED) return false;
  return ::unlink(address.sun_path) == 0;
}

void removeDeadSockets(SystemLog& log) {
  const auto directory = RuntimeDirectory::open(log);
  const FileDescriptor lock = directory ? directory->lock(log) : FileDescriptor();
  if (!lock) return;
  for (const std::string& room : directory->rooms()) removeDeadSocketsIn(room, log);
}

}  // namespace kelvasi
