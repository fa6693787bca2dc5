// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/RuntimeDirectory.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <thread>
#include <utility>

#include "Platform/Qt/AccessGroup.h"
#include "Platform/Qt/RuntimeDirectoryFaults.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr mode_t lockMode = 0600;
constexpr mode_t sharedLockMode = 0640;
constexpr mode_t sharedSocketMode = 0660;
constexpr auto lockPatience = 1000ms;
constexpr auto lockInterval = 5ms;

bool exists(const sockaddr_un& address) {
  struct stat found {};
  return ::lstat(address.sun_path, &found) == 0;
}

uid_t ownerOf(const std::string& path) {
  struct stat found {};
  return ::lstat(path.c_str(), &found) == 0 ? found.st_uid : ::geteuid();
}

}  // namespace

RuntimeDirectory::RuntimeDirectory(std::string path, std::optional<gid_t> group)
    : path_(std::move(path)), group_(group), isOwner_(ownerOf(path_) == ::geteuid()) {}

RuntimeDirectory::Place RuntimeDirectory::look(Side side) {
  std::string path = runtimePathFromEnvironment();
  const AccessGroup group = AccessGroup::ofEnvironment();
  std::string fault = group.fault.empty() ? makeAndCheck(path, group.id, side == Side::daemon) : group.fault;
  return {.path = std::move(path), .fault = std::move(fault)};
}

std::optional<RuntimeDirectory> RuntimeDirectory::open(SystemLog& log, Side side) {
  Place place = look(side);
  if (!place.fault.empty()) {
    log.print(LogPriority::error, "Runtime directory \"%s\" refused: %s", place.path.c_str(),
              place.fault.c_str());
    return std::nullopt;
  }
  return RuntimeDirectory(std::move(place.path), AccessGroup::ofEnvironment().id);
}

std::string RuntimeDirectory::guestRoom() const {
  return path_ + "/" + guestRoomName;
}

std::vector<std::string> RuntimeDirectory::rooms() const {
  if (!group_) return {path_};
  return {path_, guestRoom()};
}

std::optional<sockaddr_un> RuntimeDirectory::addressIn(const std::string& room, std::string_view name,
                                                       SystemLog& log) {
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  const std::string path = room + "/" + std::string(name);
  const char* fault = faultOfPortName(name);
  if (!fault && path.size() >= sizeof address.sun_path) fault = "makes too long a path";
  if (fault) {
    log.print(LogPriority::error, "Port name \"%s\" refused: %s", printablePortName(name).c_str(), fault);
    return std::nullopt;
  }
  std::ranges::copy(path, address.sun_path);
  return address;
}

std::optional<sockaddr_un> RuntimeDirectory::addressToListen(std::string_view name, SystemLog& log) const {
  return addressIn(isGuest() ? guestRoom() : path_, name, log);
}

// Nobody but the owner can have put a socket into the directory itself, so its names come first.
std::optional<sockaddr_un> RuntimeDirectory::addressToReach(std::string_view name, SystemLog& log) const {
  const auto own = addressIn(path_, name, log);
  if (!own || !group_ || !isOwner_ || exists(*own)) return own;
  return addressIn(guestRoom(), name, log);
}

AllowedPeers RuntimeDirectory::allowedCallers() const {
  return {.ofThisUser = true, .ofGroup = group_};
}

// What guests put there may be a link to anything; what it leads to is then no process of ours.
AllowedPeers RuntimeDirectory::allowedAt(const sockaddr_un& address) const {
  const bool isAtGuests = group_ && std::string_view(address.sun_path).starts_with(guestRoom() + "/");
  return {.ofThisUser = !isAtGuests, .ofGroup = group_};
}

int RuntimeDirectory::admitCallers(const sockaddr_un& address) const {
  return !group_ || ::chmod(address.sun_path, sharedSocketMode) == 0 ? 0 : errno;
}

// Guests may not write to the file, and need not.
FileDescriptor RuntimeDirectory::lock(SystemLog& log) const {
  const std::string path = path_ + "/.lock";
  const int access = isGuest() ? O_RDONLY : O_RDWR | O_CREAT;
  FileDescriptor file(::open(path.c_str(), access | O_CLOEXEC | O_NOFOLLOW, lockMode));
  if (file && group_ && isOwner_) ::fchmod(file.number(), sharedLockMode);
  const auto deadline = std::chrono::steady_clock::now() + lockPatience;
  while (file && ::flock(file.number(), LOCK_EX | LOCK_NB) != 0) {
    if (errno == EINTR) continue;
    if (errno != EWOULDBLOCK || std::chrono::steady_clock::now() >= deadline) {
      file.close();
      break;
    }
    std::this_thread::sleep_for(lockInterval);
  }
  if (!file) log.print(LogPriority::error, "%s: cannot be locked: %s", path.c_str(), std::strerror(errno));
  return file;
}

}  // namespace kelvasi
