// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/PilotSets.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace kelvasi::sim::c2k {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

using Ratios = std::vector<double>;

void passConnected(PilotSets& sets, const Ratios& ratios, double seconds) {
  for (int turn = 0; turn < static_cast<int>(seconds * 5 + 0.5); ++turn) sets.passConnected(ratios, 0.2);
}
void passIdle(PilotSets& sets, const Ratios& ratios, double seconds) {
  for (int turn = 0; turn < static_cast<int>(seconds * 5 + 0.5); ++turn) sets.passIdle(ratios, 0.2);
}

TEST(PilotSets, AStrongPilotBecomesACandidateAndThenActive) {
  PilotSets sets(3);
  sets.acquire(0);
  passConnected(sets, {-8, -13, -21}, 0.2);
  EXPECT_THAT(sets.active(), ElementsAre(0));
  EXPECT_THAT(sets.candidates(), ElementsAre(1));
  EXPECT_THAT(sets.neighbours(), ElementsAre(2));
  passConnected(sets, {-8, -13, -21}, 1);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1));
  EXPECT_THAT(sets.candidates(), IsEmpty());
}

TEST(PilotSets, AWeakActivePilotIsDroppedWhenItsTimerHasRunOut) {
  PilotSets sets(2);
  sets.acquire(0);
  passConnected(sets, {-8, -13}, 1);
  passConnected(sets, {-17, -9}, 3.8);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1));
  passConnected(sets, {-15, -9}, 0.2);  // the timer begins anew
  passConnected(sets, {-17, -9}, 3.8);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1));
  passConnected(sets, {-17, -9}, 0.4);
  EXPECT_THAT(sets.active(), ElementsAre(1));
  EXPECT_THAT(sets.neighbours(), ElementsAre(0));
}

TEST(PilotSets, TheLastActivePilotStays) {
  PilotSets sets(2);
  sets.acquire(0);
  passConnected(sets, {-30, -30}, 20);
  EXPECT_THAT(sets.active(), ElementsAre(0));
}

TEST(PilotSets, AFullSetTakesOnlyAMuchBetterPilot) {
  PilotSets sets(7);
  sets.acquire(0);
  Ratios ratios{-13, -13, -13, -13, -13, -13.5, -12};
  ratios[6] = -20;
  passConnected(sets, ratios, 1);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1, 2, 3, 4, 5));
  ratios[6] = -11.5;
  passConnected(sets, ratios, 1);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1, 2, 3, 4, 5));
  EXPECT_THAT(sets.candidates(), ElementsAre(6));
  ratios[6] = -10.5;
  passConnected(sets, ratios, 0.2);
  EXPECT_THAT(sets.active(), ElementsAre(0, 1, 2, 3, 4, 6));
}

TEST(PilotSets, InIdleOnePilotFollowsTheOther) {
  PilotSets sets(2);
  sets.acquire(0);
  passIdle(sets, {-10, -8}, 5);
  EXPECT_THAT(sets.active(), ElementsAre(0));
  passIdle(sets, {-12, -8}, 0.8);
  EXPECT_THAT(sets.active(), ElementsAre(0));
  passIdle(sets, {-12, -8}, 0.4);
  EXPECT_THAT(sets.active(), ElementsAre(1));
  EXPECT_THAT(sets.neighbours(), ElementsAre(0));
}

TEST(PilotSets, TheStrongestOfThemOutlivesTheConnection) {
  PilotSets sets(3);
  sets.acquire(0);
  passConnected(sets, {-10, -9, -20}, 1);
  sets.endHandOff(Ratios{-10, -9, -5});
  EXPECT_THAT(sets.active(), ElementsAre(1));
  sets.clear();
  sets.endHandOff(Ratios{-10, -9, -5});
  EXPECT_THAT(sets.active(), IsEmpty());
}

}  // namespace
}  // namespace kelvasi::sim::c2k
