// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Surroundings.h"

#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::Variable;

constexpr const char* level = "KELVASI_LOG_LEVEL";

const SurroundingsOptions options{.resources = ".", .logsToStderr = false};

bool wants(const Surroundings& surroundings, LogPriority priority) {
  return surroundings.log->wants(priority);
}

TEST(OfflineSurroundings, WriteErrorsOnlyToSyslog) {
  const Variable unset(level, std::nullopt);
  const OfflineSurroundings surroundings(options);
  EXPECT_TRUE(wants(surroundings, LogPriority::error));
  EXPECT_TRUE(wants(surroundings, LogPriority::critical));
  EXPECT_FALSE(wants(surroundings, LogPriority::warning));
}

TEST(OfflineSurroundings, WriteMoreWhereThatIsAskedFor) {
  {
    const Variable debug(level, "debug");
    EXPECT_TRUE(wants(OfflineSurroundings(options), LogPriority::debug));
  }
  const Variable unset(level, std::nullopt);
  const SurroundingsOptions toStderr{.resources = ".", .logsToStderr = true};
  EXPECT_TRUE(wants(OfflineSurroundings(toStderr), LogPriority::debug));
  const Variable critical(level, "crit");
  EXPECT_FALSE(wants(OfflineSurroundings(toStderr), LogPriority::error));
}

TEST(Surroundings, WriteEverythingUnlessLessIsAskedFor) {
  const Variable unset(level, std::nullopt);
  EXPECT_TRUE(wants(Surroundings(options), LogPriority::debug));
}

}  // namespace
}  // namespace kelvasi
