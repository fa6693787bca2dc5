#include "Platform/Posix/TerminateHandler.h"

#include <cxxabi.h>

#include <atomic>
#include <cstdlib>
#include <exception>
#include <memory>
#include <string>
#include <typeinfo>

namespace kelvasi {

namespace {

// The runtime's hook takes a function and nothing else, so the log has to be reached this way.
std::atomic<SystemLog*>& lastLog() {
  static std::atomic<SystemLog*> log = nullptr;
  return log;
}

struct Free {
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

[[noreturn]] void terminate() {
  // Taken away first: should the log itself fail, the second call ends at once.
  if (SystemLog* log = lastLog().exchange(nullptr)) log->print(LogPriority::critical, "%s", reason().c_str());
  std::abort();
}

}  // namespace

void installTerminateHandler(SystemLog& log) {
  lastLog() = &log;
  std::set_terminate(terminate);
}

}  // namespace kelvasi
