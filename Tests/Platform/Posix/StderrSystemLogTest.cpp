// SPDX-License-Identifier: Apache-2.0
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Platform/Posix/SystemLogs.h"
#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;
using testing::Variable;
using testing::WritesTo;

TEST(StderrSystemLog, WritesEachLineAtOnceWithItsPriority) {
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log{LogLevel()};
  log.write(LogPriority::error, "first");
  log.print(LogPriority::warning, "%s %d", "second", 2);
  log.write(LogPriority::dlf, "third");
  EXPECT_THAT(standardError.take(), ElementsAre("<3>first\n", "<4>second 2\n", "<16>third\n"));
}

TEST(StderrSystemLog, TakesALineFeedAtTheEndForTheEnd) {
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log{LogLevel()};
  log.write(LogPriority::error, "Failed to get Cell Array\n");
  log.write(LogPriority::error, "two\n\n");
  log.write(LogPriority::error, "\n");
  log.write(LogPriority::error, "");
  EXPECT_THAT(standardError.take(),
              ElementsAre("<3>Failed to get Cell Array\n", "<3>two\n\n", "<3>\n", "<3>\n"));
}

TEST(StderrSystemLog, KeepsLineFeedsInsideAText) {
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log{LogLevel()};
  log.write(LogPriority::notice, "{\n    a = 1;\n}");
  EXPECT_THAT(standardError.take(), ElementsAre("<5>{\n    a = 1;\n}\n"));
}

TEST(StderrSystemLog, WritesALineLongerThanAPrintBufferWhole) {
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log{LogLevel()};
  const std::string text(20000, 'x');
  log.print(LogPriority::info, "%s", text.c_str());
  EXPECT_THAT(standardError.take(), ElementsAre("<6>" + text + "\n"));
}

TEST(StderrSystemLog, WritesNothingBelowItsLevel) {
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log{LogLevel("err")};
  EXPECT_FALSE(log.wants(LogPriority::warning));
  log.print(LogPriority::warning, "masked");
  log.write(LogPriority::warning, "masked");
  EXPECT_THAT(standardError.take(), IsEmpty());
  EXPECT_TRUE(log.wants(LogPriority::dlf));
}

TEST(StderrSystemLog, SaysOnceThatTheVariableMakesNoSense) {
  const Variable variable("KELVASI_LOG_LEVEL", "loud");
  WritesTo standardError(STDERR_FILENO);
  StderrSystemLog log;
  log.write(LogPriority::debug, "passes");
  EXPECT_THAT(standardError.take(), ElementsAre(StartsWith("<4>KELVASI_LOG_LEVEL"), "<7>passes\n"));
}

}  // namespace
}  // namespace kelvasi
