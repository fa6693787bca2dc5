#include "Platform/Posix/Files.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <system_error>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

namespace {

std::string lastError(const std::string& path) {
  return path + ": " + std::generic_category().message(errno);
}

int openFile(const std::string& path, int flags) {
  constexpr mode_t permissions = 0666;  // less the umask
  int number = -1;
  do {
    number = ::open(path.c_str(), flags | O_CLOEXEC, permissions);
  } while (number < 0 && errno == EINTR);
  return number;
}

bool isRegular(const FileDescriptor& file) {
  struct stat status {};
  return ::fstat(file.number(), &status) == 0 && S_ISREG(status.st_mode);
}

// Where the symbolic links lead, to a file that is yet to be made perhaps. The last link after too many.
std::string targetOf(const std::string& path) {
  constexpr int mostLinks = 40;
  std::filesystem::path target = path;
  for (int count = 0; count < mostLinks; ++count) {
    std::error_code error;
    const std::filesystem::path next = std::filesystem::read_symlink(target, error);
    if (error) break;
    target = target.parent_path() / next;
  }
  return target;
}

FileError writeInto(const std::string& path, std::span<const std::uint8_t> bytes) {
  FileDescriptor file(openFile(path, O_WRONLY));
  if (file && writeAll(file.number(), bytes) && file.close()) return std::nullopt;
  return lastError(path);
}

// A new file next to `path`, whose name is left in `temporary`. None, with errno set, when there cannot be
// one.
FileDescriptor createBeside(const std::string& path, std::string& temporary) {
  const std::string stem = path + "." + std::to_string(::getpid()) + ".";
  int number = -1;
  for (int attempt = 0; number < 0 && attempt < 100; ++attempt) {
    temporary = stem + std::to_string(attempt);
    number = openFile(temporary, O_WRONLY | O_CREAT | O_EXCL);
    if (number < 0 && errno != EEXIST) break;
  }
  return FileDescriptor(number);
}

// The rename itself must reach the disk too; where a directory cannot be synchronised nothing is lost but
// that.
void synchroniseDirectoryOf(const std::string& path) {
  const std::size_t slash = path.rfind('/');
  const std::string directory = slash == std::string::npos ? "." : path.substr(0, slash + 1);
  const FileDescriptor opened(openFile(directory, O_RDONLY | O_DIRECTORY));
  if (opened) ::fsync(opened.number());
}

}  // namespace

FileContents readFile(const std::string& path, std::size_t limit) {
  const FileDescriptor file(openFile(path, O_RDONLY));
  if (!file) return {{}, lastError(path)};
  FileContents contents;
  std::array<std::uint8_t, 65536> block;
  while (true) {
    const ssize_t count = ::read(file.number(), block.data(), block.size());
    if (count == 0) return contents;
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return {{}, lastError(path)};
    if (static_cast<std::size_t>(count) > limit - contents.bytes.size()) {
      return {{}, path + ": Larger than " + std::to_string(limit) + " bytes"};
    }
    contents.bytes.insert(contents.bytes.end(), block.begin(), block.begin() + count);
  }
}

FileError writeFile(const std::string& path, std::span<const std::uint8_t> bytes) {
  FileDescriptor file(openFile(path, O_WRONLY | O_CREAT | O_TRUNC));
  if (!file) return lastError(path);
  const bool isRemovable = isRegular(file);
  if (writeAll(file.number(), bytes) && file.close()) return std::nullopt;
  const std::string error = lastError(path);
  if (isRemovable) ::unlink(path.c_str());
  return error;
}

FileError replaceFile(const std::string& path, std::span<const std::uint8_t> bytes) {
  struct stat old {};
  const bool exists = ::stat(path.c_str(), &old) == 0;
  if (!exists && errno != ENOENT) return lastError(path);
  if (exists && !S_ISREG(old.st_mode)) return writeInto(path, bytes);
  const std::string target = targetOf(path);
  std::string temporary;
  FileDescriptor file = createBeside(target, temporary);
  if (!file) return lastError(path);
  const bool keepsPermissions = !exists || ::fchmod(file.number(), old.st_mode & 07777) == 0;
  const bool replaced = keepsPermissions && writeAll(file.number(), bytes) && ::fsync(file.number()) == 0 &&
                        file.close() && std::rename(temporary.c_str(), target.c_str()) == 0;
  if (!replaced) {
    const std::string error = lastError(path);
    ::unlink(temporary.c_str());
    return error;
  }
  synchroniseDirectoryOf(target);
  return std::nullopt;
}

}  // namespace kelvasi
