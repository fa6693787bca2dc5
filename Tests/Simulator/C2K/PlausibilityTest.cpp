// SPDX-License-Identifier: Apache-2.0
// What a radio engineer looks at first in a CDMA drive, over half an hour of several towns.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Simulator/C2K/DriveScenario.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/Simulator/DisplayTexts.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::c2k {
namespace {

using testing::AnyOf;

constexpr int manySteps = 9000;  // half an hour

// A leaf for each lookup name, called after it.
PlistValue displayTemplate() {
  const auto leaves = PlistDictionary::make();
  for (const std::string_view name : kelvasi::test::c2kLookupNames()) leaves->set(name, name);
  return leaves;
}

class CdmaPlausibility : public testing::TestWithParam<std::uint64_t> {
 protected:
  template <typename Look>
  void play(Look look) {
    test::play(scenario, manySteps, [&](const Messages& messages) {
      viewer.take(messages);
      look(messages);
    });
  }
  const World& world() const { return scenario.world(); }
  std::string text(std::string_view name) const {
    const PlistValue value = viewer.sectionOf(name);
    return value.string() ? *value.string() : "(no text)";
  }

  LibplistSerialiser plists;
  DriveScenario scenario{GetParam(), plists};
  test::DecodingViewer viewer{kTelvonLogChannelTechnology_Orvane_CDMA, "C2KTemplate", displayTemplate()};
};

INSTANTIATE_TEST_SUITE_P(Seeds, CdmaPlausibility, testing::Values(1, 7, 42, 2024));

// Pilots are reported in half dB down from 0 in six bits (3GPP2 C.S0005, 2.7.2.3.2.5).
TEST_P(CdmaPlausibility, NoPilotIsWeakerThanCanBeReported) {
  play([&](const Messages&) {
    for (const char* list : {"k1xActiveSetInfo", "kActiveSetPilots", "kFingerC2I"}) {
      for (const auto& [path, shown] : test::textsOf(viewer.sectionOf(list))) {
        ASSERT_EQ(shown.find("inf"), std::string::npos) << list << path << ": " << shown;
        const std::size_t sign = shown.find_first_of("+-");
        if (sign == std::string::npos) continue;
        ASSERT_GE(std::stod(shown.substr(sign)), -31.6) << list << path << ": " << shown;
      }
    }
  });
}

TEST_P(CdmaPlausibility, WithoutDataTheRatesAreZeroWithinTwoSeconds) {
  int quietSteps = 0;
  int interruptions = 0;
  bool wasTransferring = false;
  play([&](const Messages&) {
    const bool isTransferring = world().evdo().isTransferring();
    quietSteps = isTransferring ? 0 : quietSteps + 1;
    interruptions += wasTransferring && world().evdo().state() == Evdo::State::inactive;
    wasTransferring = isTransferring;
    if (quietSteps <= 11) return;
    for (const char* rate : {"kFLDataRate", "kRLDataRate"})
      ASSERT_THAT(text(rate), AnyOf("0.00 kbps", "", rate)) << rate;
  });
  EXPECT_GT(interruptions, 0);
}

}  // namespace
}  // namespace kelvasi::sim::c2k
