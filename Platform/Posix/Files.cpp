// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/Files.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdio>
#include <system_error>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

std::string lastError(const std::string& path) {
  return path + ": " + std::generic_category().message(errno);
}

bool exists(const std::string& path) {
  struct stat status {};
  return ::stat(path.c_str(), &status) == 0;
}

FileError writeInto(const std::string& path, std::span<const std::uint8_t> bytes) {
  FileDescriptor file = openFile(path, O_WRONLY);
  if (file && writeAll(file.number(), bytes) && file.close()) return std::nullopt;
  return lastError(path);
}

}  // namespace

FileContents readFile(const std::string& path, std::size_t limit) {
  const FileDescriptor file = openFile(path, O_RDONLY);
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
  if (exists(path)) return replaceFile(path, bytes);
  const std::string target = targetOf(path);
  FileDescriptor file = createFile(target);
  if (!file && errno == EEXIST) return replaceFile(path, bytes);  // made in between, or a link to itself
  if (!file) return lastError(path);
  if (writeAll(file.number(), bytes) && file.close()) return std::nullopt;
  const std::string error = lastError(path);
  ::unlink(target.c_str());
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
  const bool replaced = writeAll(file.number(), bytes) && ::fsync(file.number()) == 0 && file.close() &&
                        std::rename(temporary.c_str(), target.c_str()) == 0;
  if (!replaced) {
    const std::string error = lastError(path);
    ::unlink(temporary.c_str());
    return error;
  }
  synchroniseDirectoryOf(target);
  return std::nullopt;
}

}  // namespace kelvasi
