// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Theme.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace kelvasi::terminal {
namespace {

// WCAG 2.1, relative luminance.
double luminance(std::uint32_t colour) {
  const auto channel = [colour](unsigned shift) {
    const double level = static_cast<double>(colour >> shift & 0xFF) / 255;
    return level <= 0.03928 ? level / 12.92 : std::pow((level + 0.055) / 1.055, 2.4);
  };
  return 0.2126 * channel(16) + 0.7152 * channel(8) + 0.0722 * channel(0);
}

double contrast(std::uint32_t one, std::uint32_t other) {
  const auto [less, more] = std::minmax({luminance(one), luminance(other)});
  return (more + 0.05) / (less + 0.05);
}

TEST(Theme, TextsCanBeRead) {
  for (const Role role : {Role::secondary, Role::stale, Role::accent, Role::good, Role::fair, Role::poor}) {
    EXPECT_GE(contrast(*darkTheme().of(role), 0x000000), 4.5) << static_cast<int>(role);
    EXPECT_GE(contrast(*lightTheme().of(role), 0xFFFFFF), 4.5) << static_cast<int>(role);
  }
}

TEST(Theme, AFileChangesColours) {
  Theme theme = darkTheme();
  EXPECT_EQ(theme.change("good #00ff80"), "");
  EXPECT_EQ(theme.change("  ground   #101010   # behind everything"), "");
  EXPECT_EQ(theme.change("accent default"), "");
  EXPECT_EQ(theme.change("# a remark"), "");
  EXPECT_EQ(theme.change(""), "");
  EXPECT_EQ(theme.of(Role::good), 0x00FF80U);
  EXPECT_EQ(theme.ground, 0x101010U);
  EXPECT_EQ(theme.of(Role::accent), std::nullopt);
}

TEST(Theme, WhatMakesNoSenseIsTold) {
  Theme theme = darkTheme();
  EXPECT_EQ(theme.change("lamp #000000"), "there is no role \"lamp\"");
  for (const char* line : {"good", "good green", "good #12345", "good #12345g", "good #123456 x"})
    EXPECT_EQ(theme.change(line), "expected \"good #RRGGBB\" or \"good default\"") << line;
  EXPECT_EQ(theme.of(Role::good), darkTheme().of(Role::good));
}

TEST(Theme, FewerColoursAreTheNearest) {
  EXPECT_EQ(nearestOf256(0x000000), 16);
  EXPECT_EQ(nearestOf256(0xFFFFFF), 231);
  EXPECT_EQ(nearestOf256(0xFF0000), 196);
  EXPECT_EQ(nearestOf256(0x5F87AF), 67);
  EXPECT_EQ(nearestOf256(0x808080), 244);
  EXPECT_EQ(nearestOf8(Role::text), -1);
  EXPECT_EQ(nearestOf8(Role::poor), 1);
}

}  // namespace
}  // namespace kelvasi::terminal
