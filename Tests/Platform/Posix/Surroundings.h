// SPDX-License-Identifier: Apache-2.0
// Pieces of the process's surroundings that a test changes and gives back.
#pragma once

#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace kelvasi::testing {

// An environment variable; no value takes it away.
class Variable {
 public:
  Variable(std::string name, std::optional<std::string> value) : name_(std::move(name)) {
    if (const char* standing = std::getenv(name_.c_str())) before_ = standing;
    set(value);
  }
  ~Variable() { set(before_); }
  Variable(const Variable&) = delete;
  Variable& operator=(const Variable&) = delete;

 private:
  void set(const std::optional<std::string>& value) {
    value ? ::setenv(name_.c_str(), value->c_str(), 1) : ::unsetenv(name_.c_str());
  }

  std::string name_;
  std::optional<std::string> before_;
};

class TemporaryDirectory {
 public:
  TemporaryDirectory() {
    std::string pattern = (std::filesystem::temp_directory_path() / "kelvasi-XXXXXX").native();
    path_ = ::mkdtemp(pattern.data());
  }
  ~TemporaryDirectory() { std::filesystem::remove_all(path_); }
  TemporaryDirectory(const TemporaryDirectory&) = delete;
  TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

  const std::filesystem::path& path() const { return path_; }
  std::string file(const std::string& name) const { return (path_ / name).native(); }

 private:
  std::filesystem::path path_;
};

// Files of this process end at `bytes`; a write beyond is cut short, the next one fails.
class FileSizeLimit {
 public:
  explicit FileSizeLimit(rlim_t bytes) : signal_(std::signal(SIGXFSZ, SIG_IGN)) {
    ::getrlimit(RLIMIT_FSIZE, &before_);
    const rlimit limit{bytes, before_.rlim_max};
    ::setrlimit(RLIMIT_FSIZE, &limit);
  }
  ~FileSizeLimit() {
    ::setrlimit(RLIMIT_FSIZE, &before_);
    std::signal(SIGXFSZ, signal_);
  }
  FileSizeLimit(const FileSizeLimit&) = delete;
  FileSizeLimit& operator=(const FileSizeLimit&) = delete;

 private:
  rlimit before_{};
  void (*signal_)(int);
};

class Umask {
 public:
  explicit Umask(mode_t mask) : before_(::umask(mask)) {}
  ~Umask() { ::umask(before_); }
  Umask(const Umask&) = delete;
  Umask& operator=(const Umask&) = delete;

 private:
  mode_t before_;
};

// Stands in for a standard stream and keeps its writes apart.
class WritesTo {
 public:
  explicit WritesTo(int descriptor) : descriptor_(descriptor), before_(::dup(descriptor)) {
    if (::socketpair(AF_UNIX, SOCK_SEQPACKET, 0, ends_) != 0) std::abort();
    ::dup2(ends_[0], descriptor_);
  }
  ~WritesTo() {
    ::dup2(before_, descriptor_);
    for (const int open : {before_, ends_[0], ends_[1]}) ::close(open);
  }
  WritesTo(const WritesTo&) = delete;
  WritesTo& operator=(const WritesTo&) = delete;

  // All since the last call, one string for each write.
  std::vector<std::string> take() {
    std::vector<std::string> writes;
    std::string text(65536, '\0');
    for (ssize_t count = 0; (count = ::recv(ends_[1], text.data(), text.size(), MSG_DONTWAIT)) >= 0;) {
      writes.push_back(text.substr(0, static_cast<std::size_t>(count)));
    }
    return writes;
  }

 private:
  int descriptor_;
  int before_;
  int ends_[2] = {-1, -1};
};

}  // namespace kelvasi::testing
