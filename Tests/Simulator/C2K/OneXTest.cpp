// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/OneX.h"

#include <gtest/gtest.h>

#include <array>

namespace kelvasi::sim::c2k {
namespace {

constexpr std::array ratios{-5.0};

// Until the stage is reached, at most a minute of it; true when it is.
bool passUntil(OneX& oneX, OneX::Stage stage, bool wantsCall) {
  for (int turn = 0; turn < 300 && oneX.stage() != stage; ++turn) oneX.pass(ratios, wantsCall, 0.2);
  return oneX.stage() == stage;
}

// Registered, and idle.
OneX registered() {
  OneX oneX(ratios.size(), Random(1));
  EXPECT_TRUE(passUntil(oneX, OneX::Stage::accessing, false));
  EXPECT_TRUE(passUntil(oneX, OneX::Stage::idle, false));
  return oneX;
}

TEST(OneX, ARegistrationAndACallTakeTheRadio) {
  OneX oneX(ratios.size(), Random(1));
  EXPECT_FALSE(oneX.takesRadio());
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::accessing, false));
  EXPECT_TRUE(oneX.takesRadio());
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::idle, false));
  EXPECT_FALSE(oneX.takesRadio());
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::inCall, true));
  EXPECT_TRUE(oneX.takesRadio());
}

TEST(OneX, ACallThatIsGivenUpDuringAccessIsNeverInTraffic) {
  OneX oneX = registered();
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::accessing, true));
  for (int turn = 0; turn < 50; ++turn) {
    oneX.pass(ratios, false, 0.2);
    EXPECT_NE(oneX.state(), OneX::State::traffic) << turn;
  }
  EXPECT_EQ(oneX.stage(), OneX::Stage::idle);
}

TEST(OneX, ACallThatIsWantedDuringARegistrationComesAfterIt) {
  OneX oneX(ratios.size(), Random(1));
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::accessing, false));
  ASSERT_TRUE(passUntil(oneX, OneX::Stage::idle, true));
  EXPECT_TRUE(passUntil(oneX, OneX::Stage::inCall, true));
}

}  // namespace
}  // namespace kelvasi::sim::c2k
