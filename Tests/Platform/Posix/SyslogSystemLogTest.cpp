// SPDX-License-Identifier: Apache-2.0
// syslog(3) itself is stood in for: the definitions here come before those of the C library.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <syslog.h>

#include <cstdarg>
#include <cstdio>

#include "Platform/Posix/SystemLogs.h"
#include "Tests/Platform/Posix/Surroundings.h"

namespace {

struct Recorded {
  const char* identity = nullptr;
  std::vector<std::string> lines;  // "<priority>text"
};

Recorded& recorded() {
  static Recorded record;
  return record;
}

void record(int priority, const char* format, std::va_list arguments) {
  char text[1024];
  std::vsnprintf(text, sizeof text, format, arguments);
  recorded().lines.push_back("<" + std::to_string(priority) + ">" + text);
}

}  // namespace

extern "C" {
void openlog(const char* identity, int, int) {
  recorded() = {identity, {}};
}
void closelog() {
  recorded().identity = nullptr;
}
void syslog(int priority, const char* format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  record(priority, format, arguments);
  va_end(arguments);
}
// What syslog becomes where the compiler fortifies it.
void __syslog_chk(int priority, int, const char* format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  record(priority, format, arguments);
  va_end(arguments);
}
}

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;
using testing::Variable;

TEST(SyslogSystemLog, OpensUnderItsNameAndCloses) {
  {
    const SyslogSystemLog log;
    EXPECT_STREQ(recorded().identity, "kelvasi");
  }
  EXPECT_EQ(recorded().identity, nullptr);
  const SyslogSystemLog other("telvon-sim");
  EXPECT_STREQ(recorded().identity, "telvon-sim");
}

TEST(SyslogSystemLog, PassesPriorityNumbersAsTheyAre) {
  SyslogSystemLog log("kelvasi", LogLevel());
  log.write(LogPriority::error, "text");
  log.write(LogPriority::dlf, "text");
  EXPECT_THAT(recorded().lines, ElementsAre("<3>text", "<16>text"));
}

TEST(SyslogSystemLog, NeverTakesATextForAFormat) {
  SyslogSystemLog log("kelvasi", LogLevel());
  log.write(LogPriority::error, "100 %s %n");
  EXPECT_THAT(recorded().lines, ElementsAre("<3>100 %s %n"));
}

TEST(SyslogSystemLog, WritesTheViewAndNoMore) {
  SyslogSystemLog log("kelvasi", LogLevel());
  log.write(LogPriority::error, std::string_view("a line\nand more").substr(0, 7));
  EXPECT_THAT(recorded().lines, ElementsAre("<3>a line"));
}

TEST(SyslogSystemLog, WritesNothingBelowItsLevel) {
  SyslogSystemLog log("kelvasi", LogLevel("emerg"));
  log.write(LogPriority::error, "masked");
  EXPECT_THAT(recorded().lines, IsEmpty());
  log.print(LogPriority::dlf, "passes");
  EXPECT_THAT(recorded().lines, ElementsAre("<16>passes"));
}

TEST(SyslogSystemLog, SaysOnceThatTheVariableMakesNoSense) {
  const Variable variable("KELVASI_LOG_LEVEL", "9");
  const SyslogSystemLog log;
  EXPECT_THAT(recorded().lines, ElementsAre(StartsWith("<4>KELVASI_LOG_LEVEL")));
}

}  // namespace
}  // namespace kelvasi
