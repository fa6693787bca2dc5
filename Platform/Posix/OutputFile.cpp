// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/OutputFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <system_error>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

enum class There { nothing, file, other };

There whatIsAt(const std::string& path) {
  struct stat status {};
  if (::stat(path.c_str(), &status) != 0) return There::nothing;
  return S_ISREG(status.st_mode) ? There::file : There::other;
}

}  // namespace

OutputFile::OutputFile(const std::string& path, Existing existing)
    : name_(path == "-" ? "standard output" : path),
      target_(path == "-" ? path : targetOf(path)),
      file_(open(path, existing)),
      isMade_(file_ && path != "-" && isRegular(file_)) {
  if (!file_) fail();
}

OutputFile::~OutputFile() {
  if (isMade_) ::unlink(hasOlder() ? temporary_.c_str() : target_.c_str());
}

// A regular file that it opens is one that it made.
FileDescriptor OutputFile::open(const std::string& path, Existing existing) {
  if (path == "-") return FileDescriptor(::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 0));
  const There there = whatIsAt(path);
  if (there == There::other) return openFile(path, O_WRONLY);
  const bool isBeside = there == There::file && existing == Existing::isReplaced;
  return isBeside ? createBeside(target_, temporary_) : createFile(target_);
}

bool OutputFile::append(std::span<const std::uint8_t> piece) {
  if (error_) return false;
  return writeWhole(file_.number(), piece) || fail();
}

bool OutputFile::publish() {
  if (error_ || !isMade_) return !error_;
  if (hasOlder() && std::rename(temporary_.c_str(), target_.c_str()) != 0) return fail();
  temporary_.clear();
  isMade_ = false;
  return true;
}

bool OutputFile::close() {
  if (error_) return false;
  if (isRegular(file_) && ::fsync(file_.number()) != 0) return fail();
  return file_.close() || fail();
}

bool OutputFile::fail() {
  error_ = name_ + ": " + std::generic_category().message(errno);
  return false;
}

}  // namespace kelvasi
