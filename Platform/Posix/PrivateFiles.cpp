// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PrivateFiles.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

namespace kelvasi {

namespace {

constexpr mode_t fileMode = 0600;
constexpr mode_t folderMode = 0700;

int openNumber(const std::string& path, int flags) {
  int number = -1;
  do {
    number = ::open(path.c_str(), flags | O_CLOEXEC, fileMode);
  } while (number < 0 && errno == EINTR);
  return number;
}

int createNumber(const std::string& path) {
  const int number = openNumber(path, O_WRONLY | O_CREAT | O_EXCL);
  // The umask may have taken the owner's bits; a file system without permissions has none to give.
  if (number >= 0) static_cast<void>(::fchmod(number, fileMode));
  return number;
}

}  // namespace

FileDescriptor openFile(const std::string& path, int flags) {
  return FileDescriptor(openNumber(path, flags));
}

FileDescriptor createFile(const std::string& path) {
  return FileDescriptor(createNumber(path));
}

FileDescriptor createBeside(const std::string& path, std::string& temporary) {
  const std::string stem = path + "." + std::to_string(::getpid()) + ".";
  int number = -1;
  for (int attempt = 0; number < 0 && attempt < 100; ++attempt) {
    temporary = stem + std::to_string(attempt);
    number = createNumber(temporary);
    if (number < 0 && errno != EEXIST) break;
  }
  return FileDescriptor(number);
}

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

bool isRegular(const FileDescriptor& file) {
  struct stat status {};
  return ::fstat(file.number(), &status) == 0 && S_ISREG(status.st_mode);
}

void synchroniseDirectoryOf(const std::string& path) {
  const std::size_t slash = path.rfind('/');
  const std::string directory = slash == std::string::npos ? "." : path.substr(0, slash + 1);
  const FileDescriptor opened = openFile(directory, O_RDONLY | O_DIRECTORY);
  if (opened) ::fsync(opened.number());
}

void makeFolders(const std::filesystem::path& path) {
  std::filesystem::path folder;
  for (const auto& piece : path) {
    folder /= piece;
    if (::mkdir(folder.c_str(), folderMode) == 0) ::chmod(folder.c_str(), folderMode);
  }
}

}  // namespace kelvasi
