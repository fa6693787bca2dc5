// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/UnixSocket.h"

#include <fcntl.h>
#include <sys/socket.h>
#include <sys/time.h>

#include <cerrno>
#include <cstring>

#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using Clock = std::chrono::steady_clock;

bool limitWaits(int socket, Clock::duration left) {
  const auto microseconds = std::chrono::duration_cast<std::chrono::microseconds>(left).count();
  timeval limit{};
  limit.tv_sec = static_cast<time_t>(microseconds / 1'000'000);
  limit.tv_usec = static_cast<suseconds_t>(microseconds % 1'000'000);
  return ::setsockopt(socket, SOL_SOCKET, SO_SNDTIMEO, &limit, sizeof limit) == 0;
}

bool makeNonBlocking(int socket) {
  const int flags = ::fcntl(socket, F_GETFL);
  return flags >= 0 && ::fcntl(socket, F_SETFL, flags | O_NONBLOCK) == 0;
}

bool meansNobodyListens(int error) {
  return error == ENOENT || error == ECONNREFUSED;
}

}  // namespace

FileDescriptor makeUnixSocket() {
  return FileDescriptor(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
}

// connect() waits for a place in the listener's queue as long as the send time-out says.
int connectWithin(const FileDescriptor& socket, const sockaddr_un& address,
                  std::chrono::milliseconds timeout) {
  const auto deadline = Clock::now() + timeout;
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): what the call takes
  const auto* generic = reinterpret_cast<const sockaddr*>(&address);
  while (true) {
    const auto left = deadline - Clock::now();
    if (left < std::chrono::microseconds(1)) return ETIMEDOUT;
    if (!limitWaits(socket.number(), left)) return errno;
    if (::connect(socket.number(), generic, sizeof address) == 0) return 0;
    if (errno == EAGAIN) return ETIMEDOUT;
    if (errno != EINTR) return errno;
  }
}

FileDescriptor connectToName(std::string_view name, SystemLog& log) {
  const auto directory = RuntimeDirectory::open(log);
  const auto address = directory ? directory->addressToReach(name, log) : std::nullopt;
  if (!address) return {};
  FileDescriptor socket = makeUnixSocket();
  int error = socket ? connectWithin(socket, *address, connectTimeout) : errno;
  if (error == 0 && !makeNonBlocking(socket.number())) error = errno;
  if (error != 0) {
    if (!meansNobodyListens(error))
      log.print(LogPriority::error, "%s: cannot connect: %s", address->sun_path, std::strerror(error));
    return {};
  }
  if (!isPeerAllowed(socket.number(), directory->allowedAt(*address), name, log)) return {};
  return socket;
}

}  // namespace kelvasi
