// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/LogLevel.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using ::testing::HasSubstr;
using testing::Variable;

TEST(LogLevel, PassesEverythingByDefault) {
  EXPECT_TRUE(LogLevel().passes(LogPriority::emergency));
  EXPECT_TRUE(LogLevel().passes(LogPriority::debug));
}

TEST(LogLevel, PassesItsOwnLevelAndTheMoreUrgentOnes) {
  const LogLevel level("warning");
  EXPECT_TRUE(level.passes(LogPriority::error));
  EXPECT_TRUE(level.passes(LogPriority::warning));
  EXPECT_FALSE(level.passes(LogPriority::notice));
}

TEST(LogLevel, NamesAndNumbersMeanTheSame) {
  const char* names[] = {"emerg", "alert", "crit", "err", "warning", "notice", "info", "debug"};
  for (int number = 0; number < 8; ++number) {
    const LogLevel named(names[number]);
    const LogLevel numbered(std::to_string(number));
    EXPECT_EQ(named.complaint(), "");
    EXPECT_EQ(numbered.complaint(), "");
    for (int priority = 0; priority < 8; ++priority) {
      EXPECT_EQ(named.passes(LogPriority{priority}), priority <= number);
      EXPECT_EQ(numbered.passes(LogPriority{priority}), priority <= number);
    }
  }
}

TEST(LogLevel, TheDlfPriorityIsOfEmergencyLevel) {
  EXPECT_TRUE(LogLevel("emerg").passes(LogPriority::dlf));
  EXPECT_FALSE(LogLevel("emerg").passes(LogPriority::error));
}

TEST(LogLevel, AnythingElseIsEverythingAndAComplaint) {
  for (const char* text : {"8", "-1", "07", "loud", "err ", "ERR", ""}) {
    const LogLevel level{std::string_view(text)};
    EXPECT_TRUE(level.passes(LogPriority::debug)) << text;
    EXPECT_THAT(level.complaint(), HasSubstr("KELVASI_LOG_LEVEL")) << text;
    EXPECT_THAT(level.complaint(), HasSubstr(text)) << text;
  }
}

TEST(LogLevel, ComesFromTheEnvironment) {
  const Variable variable("KELVASI_LOG_LEVEL", "err");
  EXPECT_FALSE(LogLevel::fromEnvironment().passes(LogPriority::warning));
}

TEST(LogLevel, WithoutAVariableOrWithAnEmptyOneIsTheDefault) {
  for (const std::optional<std::string>& value : {std::optional<std::string>(), {""}}) {
    const Variable variable("KELVASI_LOG_LEVEL", value);
    EXPECT_TRUE(LogLevel::fromEnvironment().passes(LogPriority::debug));
    EXPECT_EQ(LogLevel::fromEnvironment().complaint(), "");
  }
}

}  // namespace
}  // namespace kelvasi
