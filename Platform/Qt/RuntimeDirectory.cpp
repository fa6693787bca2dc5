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
#include <cstdlib>
#include <cstring>
#include <thread>
#include <utility>

#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr mode_t privateMode = 0700;
constexpr mode_t modeBits = 07777;
constexpr auto lockPatience = 1000ms;
constexpr auto lockInterval = 5ms;

std::string valueOf(const char* variable) {
  const char* value = std::getenv(variable);
  return value ? value : "";
}

std::string pathFromEnvironment() {
  if (std::string own = valueOf("TELVON_RUNTIME_DIR"); !own.empty()) return own;
  const std::string shared = valueOf("XDG_RUNTIME_DIR");
  return shared.empty() ? shared : shared + "/telvon";
}

// One that is made where directories hand their group on has a bit more than was asked for.
void dropInheritedBits(const std::string& path) {
  const FileDescriptor made(::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
  if (made) ::fchmod(made.number(), privateMode);
}

// Why the directory cannot be trusted; empty when it can.
std::string faultOf(const std::string& path) {
  if (path.empty()) return "neither TELVON_RUNTIME_DIR nor XDG_RUNTIME_DIR is set";
  if (path.front() != '/') return "not an absolute path";
  if (::mkdir(path.c_str(), privateMode) == 0) {
    dropInheritedBits(path);
  } else if (errno != EEXIST) {
    return std::string("cannot be made: ") + std::strerror(errno);
  }
  struct stat found {};
  if (::lstat(path.c_str(), &found) != 0) return std::strerror(errno);
  if (S_ISLNK(found.st_mode)) return "is a symbolic link";
  if (!S_ISDIR(found.st_mode)) return "is not a directory";
  if (found.st_uid != ::geteuid()) return "belongs to another user";
  if ((found.st_mode & modeBits) != privateMode) return "its mode is not 0700";
  return {};
}

bool isControl(char character) {
  return static_cast<unsigned char>(character) < 0x20 || character == 0x7F;
}

const char* faultOfName(std::string_view name) {
  if (name.empty()) return "is empty";
  if (name.front() == '.') return "begins with a dot";
  if (name.find('/') != std::string_view::npos) return "holds a slash";
  if (std::ranges::any_of(name, isControl)) return "holds a control character";
  return nullptr;
}

std::string printable(std::string_view name) {
  std::string text(name.substr(0, 100));
  std::ranges::replace_if(text, isControl, '?');
  return text;
}

}  // namespace

RuntimeDirectory::Place RuntimeDirectory::look() {
  std::string path = pathFromEnvironment();
  while (path.size() > 1 && path.back() == '/') path.pop_back();  // a link with a slash would be followed
  std::string fault = faultOf(path);
  return {.path = std::move(path), .fault = std::move(fault)};
}

std::optional<RuntimeDirectory> RuntimeDirectory::open(SystemLog& log) {
  Place place = look();
  if (!place.fault.empty()) {
    log.print(LogPriority::error, "Runtime directory \"%s\" refused: %s", place.path.c_str(),
              place.fault.c_str());
    return std::nullopt;
  }
  return RuntimeDirectory(std::move(place.path));
}

std::optional<sockaddr_un> RuntimeDirectory::addressOf(std::string_view name, SystemLog& log) const {
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  const char* fault = faultOfName(name);
  const std::string path = path_ + "/" + std::string(name);
  if (!fault && path.size() >= sizeof address.sun_path) fault = "makes too long a path";
  if (fault) {
    log.print(LogPriority::error, "Port name \"%s\" refused: %s", printable(name).c_str(), fault);
    return std::nullopt;
  }
  std::ranges::copy(path, address.sun_path);
  return address;
}

FileDescriptor RuntimeDirectory::lock(SystemLog& log) const {
  const std::string path = path_ + "/.lock";
  FileDescriptor file(::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600));
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
