// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/ConfigPath.h"

#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::Variable;

TEST(ConfigPath, IsInTheDirectoryThatTheEnvironmentNames) {
  const Variable home("HOME", "/home/somebody");
  const Variable chosen("XDG_CONFIG_HOME", "/elsewhere");
  EXPECT_EQ(configPath("operators.csv"), "/elsewhere/kelvasi/operators.csv");
}

TEST(ConfigPath, IsInTheHomeDirectoryOtherwise) {
  const Variable home("HOME", "/home/somebody");
  for (const char* chosen : {"", "relative"}) {
    const Variable variable("XDG_CONFIG_HOME", chosen);
    EXPECT_EQ(configPath("operators.csv"), "/home/somebody/.config/kelvasi/operators.csv");
  }
}

TEST(ConfigPath, IsNowhereWithoutBoth) {
  const Variable home("HOME", std::nullopt);
  const Variable chosen("XDG_CONFIG_HOME", std::nullopt);
  EXPECT_EQ(configPath("operators.csv"), std::nullopt);
}

}  // namespace
}  // namespace kelvasi
