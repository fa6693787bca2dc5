// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/RuntimeDirectoryFaults.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

namespace {

constexpr mode_t privateMode = 0700;
constexpr mode_t sharedMode = 02750;
constexpr mode_t guestMode = 03770;
constexpr mode_t modeBits = 07777;

std::string valueOf(const char* variable) {
  const char* value = std::getenv(variable);
  return value ? value : "";
}

// One that is made where directories hand their group on has a bit more than was asked for.
bool giveAccess(const std::string& path, const std::optional<gid_t>& group, mode_t mode) {
  const FileDescriptor made(::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
  if (!made || (group && ::fchown(made.number(), static_cast<uid_t>(-1), *group) != 0)) return false;
  return ::fchmod(made.number(), mode) == 0;
}

// Why it cannot be made; empty when it is there.
std::string make(const std::string& path, const std::optional<gid_t>& group, mode_t mode) {
  if (::mkdir(path.c_str(), privateMode) != 0)
    return errno == EEXIST ? "" : std::string("cannot be made: ") + std::strerror(errno);
  if (!giveAccess(path, group, mode) && group) {
    const int error = errno;
    ::rmdir(path.c_str());
    return std::string("cannot be given to its group: ") + std::strerror(error);
  }
  return {};
}

const char* faultOfAccess(const struct stat& found, const std::optional<gid_t>& group, bool isDaemon) {
  if ((!group || isDaemon) && found.st_uid != ::geteuid()) return "belongs to another user";
  if (group && found.st_gid != *group) return "its group is not that of TELVON_GROUP";
  if ((found.st_mode & modeBits) != (group ? sharedMode : privateMode))
    return group ? "its mode is not 2750" : "its mode is not 0700";
  return nullptr;
}

bool isControl(char character) {
  return static_cast<unsigned char>(character) < 0x20 || character == 0x7F;
}

}  // namespace

std::string runtimePathFromEnvironment() {
  std::string path = valueOf("TELVON_RUNTIME_DIR");
  if (path.empty()) {
    path = valueOf("XDG_RUNTIME_DIR");
    if (!path.empty()) path += "/telvon";
  }
  while (path.size() > 1 && path.back() == '/') path.pop_back();  // a link with a slash would be followed
  return path;
}

std::string makeAndCheck(const std::string& path, const std::optional<gid_t>& group, bool isDaemon) {
  if (path.empty()) return "neither TELVON_RUNTIME_DIR nor XDG_RUNTIME_DIR is set";
  if (path.front() != '/') return "not an absolute path";
  if (!group || isDaemon) {
    if (std::string fault = make(path, group, group ? sharedMode : privateMode); !fault.empty()) return fault;
  }
  struct stat found {};
  if (::lstat(path.c_str(), &found) != 0) return std::strerror(errno);
  if (S_ISLNK(found.st_mode)) return "is a symbolic link";
  if (!S_ISDIR(found.st_mode)) return "is not a directory";
  if (const char* fault = faultOfAccess(found, group, isDaemon)) return fault;
  return group && isDaemon ? make(path + "/" + guestRoomName, group, guestMode) : "";
}

const char* faultOfPortName(std::string_view name) {
  if (name.empty()) return "is empty";
  if (name.front() == '.') return "begins with a dot";
  if (name.find('/') != std::string_view::npos) return "holds a slash";
  if (std::ranges::any_of(name, isControl)) return "holds a control character";
  return nullptr;
}

std::string printablePortName(std::string_view name) {
  std::string text(name.substr(0, 100));
  std::ranges::replace_if(text, isControl, '?');
  return text;
}

}  // namespace kelvasi
