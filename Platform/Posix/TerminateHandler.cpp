// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TerminateHandler.h"

#include <cxxabi.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <exception>
#include <memory>
#include <optional>
#include <string>
#include <typeinfo>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

namespace {

struct LastWords {
  SystemLog& log;
  std::string program;  // empty: they go to the log only
};

// The runtime's hook takes a function and nothing else, so they have to be reached this way.
std::atomic<const LastWords*>& lastWords() {
  static std::atomic<const LastWords*> words = nullptr;
  return words;
}

struct Free {
  // NOLINTNEXTLINE(cppcoreguidelines-no-malloc): this is the RAII of what a library allocated
  void operator()(char* memory) const { std::free(memory); }
};

std::string nameOf(const std::type_info& type) {
  int status = 0;
  const std::unique_ptr<char, Free> name(abi::__cxa_demangle(type.name(), nullptr, nullptr, &status));
  return name ? name.get() : type.name();
}

std::string messageOf(const std::exception_ptr& exception) {
  try {
    std::rethrow_exception(exception);
  } catch (const std::exception& standard) {
    return std::string(": ") + standard.what();
  } catch (...) {
    return {};
  }
}

std::string reason() {
  const std::exception_ptr exception = std::current_exception();
  const std::type_info* type = abi::__cxa_current_exception_type();
  if (!exception || !type) return "Terminating: no exception is under way";
  return "Terminating: uncaught " + nameOf(*type) + messageOf(exception);
}

void tellUser(const std::string& program, std::string text) {
  std::ranges::replace(text, '\n', ' ');
  const std::string line = program + ": " + text + "\n";
  // There is nowhere left to report a failure to.
  writeAll(STDERR_FILENO, {reinterpret_cast<const std::uint8_t*>(line.data()), line.size()});
}

[[noreturn]] void terminate() {
  // Taken away first: should the log itself fail, the second call ends at once.
  if (const LastWords* words = lastWords().exchange(nullptr)) {
    const std::string text = reason();
    if (!words->program.empty()) tellUser(words->program, text);
    words->log.print(LogPriority::critical, "%s", text.c_str());
  }
  std::abort();
}

}  // namespace

void installTerminateHandler(SystemLog& log, const std::string& program) {
  static std::optional<LastWords> words;
  lastWords() = nullptr;
  lastWords() = &words.emplace(LastWords{log, program});
  std::set_terminate(terminate);
}

}  // namespace kelvasi
