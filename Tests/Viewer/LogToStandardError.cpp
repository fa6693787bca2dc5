// syslog(3) on the standard error, a line each: the definitions here come before those of the C library.
#include <syslog.h>

#include <cstdarg>
#include <cstdio>

namespace {

void print(int priority, const char* format, std::va_list arguments) {
  std::fprintf(stderr, "<%d>", priority);
  std::vfprintf(stderr, format, arguments);
  std::fputc('\n', stderr);
}

}  // namespace

extern "C" {
void openlog(const char*, int, int) {}
void closelog() {}
void syslog(int priority, const char* format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  print(priority, format, arguments);
  va_end(arguments);
}
// What syslog becomes where the compiler fortifies it.
void __syslog_chk(int priority, int, const char* format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  print(priority, format, arguments);
  va_end(arguments);
}
}
