// SPDX-License-Identifier: Apache-2.0
// Half an hour of a drive as an engineer would look at it: decoded, or without a word of it.
#pragma once

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <span>
#include <string>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::test {

inline constexpr int stepsOfHalfAnHour = 9000;
// Several towns.
inline constexpr std::array<std::uint64_t, 4> plausibleSeeds{1, 7, 42, 2024};

template <typename DriveScenario, typename World>
class LongDrive : public testing::TestWithParam<std::uint64_t> {
 protected:
  template <typename... Layout>
  LongDrive(std::string_view technology, std::string_view templateName,
            std::span<const SectionOfTemplate> sections, Layout... layout)
      : untold(Random(GetParam()), layout...), viewer(technology, templateName, sections) {}

  template <typename Look>
  void play(Look look) {
    test::play(scenario, stepsOfHalfAnHour, [&](const Messages& messages) {
      viewer.take(messages);
      look(messages);
    });
  }
  // The same drive, without a word of it.
  template <typename Look>
  void pass(Look look) {
    for (int step = 0; step < stepsOfHalfAnHour && !HasFailure(); ++step) {
      untold.pass(0.2);
      SCOPED_TRACE("step " + std::to_string(step));
      look(untold);
    }
  }
  const World& world() const { return scenario.world(); }

  LibplistSerialiser plists;
  DriveScenario scenario{GetParam(), plists};
  World untold;
  DecodingViewer viewer;
};

}  // namespace kelvasi::sim::test
