// SPDX-License-Identifier: Apache-2.0
// What the cockpit shows of the simulated drives, beside their worlds: at any moment the cell that serves is
// the one shown, and no level stands beside another cell's name.
#include <gtest/gtest.h>

#include "Cockpit/Cockpit.h"
#include "Tests/Survey/Worlds.h"

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;
using test::C2k;
using test::Gsm;
using test::Lte;
using test::Named;
using test::Truth;
using test::Utran;

constexpr int steps = 4500;  // a quarter of an hour

template <typename Kind>
class LookedAtDrive {
 public:
  explicit LookedAtDrive(std::uint64_t seed)
      : cockpit_(setUp()), drive_(seed, [this](const Readings& readings, const Intake& intake) {
          cockpit_.take(readings, intake);
          return true;
        }) {}

  Snapshot step() {
    drive_.step();
    return cockpit_.at(drive_.now());
  }
  const auto& world() const { return drive_.world(); }
  const Named* named(const CellIdentity& identity) const { return drive_.named(identity); }

  void expectServing(const ServingCell& shown, std::size_t serving) {
    ASSERT_TRUE(shown.isKnown);
    const Named* named = this->named(shown.identity);
    ASSERT_TRUE(named) << textOf(shown.identity);
    ASSERT_EQ(named->place, serving) << shown.title;
    for (const Level& level : shown.levels) expectTrue(shown.identity, level);
  }
  void expectTrue(const std::vector<CellLine>& cells) {
    for (const CellLine& cell : cells) expectTrue(cell.identity, cell.level);
  }
  // Levels of now, measured by the world; older ones belong to a moment that is over.
  void expectTrue(const CellIdentity& cell, const Level& level) {
    if (!level.value || level.age.time > 0s || !receiverRow(cell.family, level.kind).empty()) return;
    const Named* named = this->named(cell);
    ASSERT_TRUE(named) << textOf(cell);
    ++checked_;
    // Whichever of its sources it came by.
    std::string truths;
    for (const LevelSource& source : definitionOf(level.kind).sources) {
      const auto truth = Kind::truth(world(), *named, *source.quantity);
      if (!truth) continue;
      const double value = source.of(truth->value);
      if (std::abs(value - *level.value) <= truth->tolerance * source.factor) return;
      truths += " " + std::to_string(value);
    }
    FAIL() << textOf(cell) << " " << level.name << " " << *level.value << ", in the world" << truths;
  }
  std::uint64_t checked() const { return checked_; }

 private:
  static CockpitSetUp setUp() {
    CockpitSetUp result;
    result.ofCells = {.series = 512, .blocks = {600, 200, 100}};
    result.ofRows = result.ofCells;
    return result;
  }

  Cockpit cockpit_;
  test::WorldDrive<Kind> drive_;
  std::uint64_t checked_ = 0;
};

template <typename Kind>
class CockpitDrive : public testing::Test {};

using Kinds = testing::Types<Gsm, Utran, Lte>;
TYPED_TEST_SUITE(CockpitDrive, Kinds);

TYPED_TEST(CockpitDrive, ShowsTheWorld) {
  for (const std::uint64_t seed : {1u, 11u, 2024u}) {
    SCOPED_TRACE(seed);
    LookedAtDrive<TypeParam> drive(seed);
    for (int turn = 0; turn < steps; ++turn) {
      SCOPED_TRACE(turn);
      const Snapshot snapshot = drive.step();
      const auto serving = TypeParam::serving(drive.world());
      if (serving) drive.expectServing(snapshot.serving, *serving);
      if (testing::Test::HasFatalFailure()) return;
      drive.expectTrue(snapshot.cells);
      if (testing::Test::HasFatalFailure()) return;
    }
    EXPECT_GT(drive.checked(), 5000U);
  }
}

TEST(CdmaCockpitDrive, ShowsTheWorld) {
  for (const std::uint64_t seed : {1u, 11u, 2024u}) {
    SCOPED_TRACE(seed);
    LookedAtDrive<C2k> drive(seed);
    std::size_t pairs = 0;
    for (int turn = 0; turn < steps; ++turn) {
      SCOPED_TRACE(turn);
      const Snapshot snapshot = drive.step();
      const auto& active = drive.world().oneX().pilots().active();
      const bool is1x = snapshot.serving.identity.family == RadioFamily::cdma;
      if (!active.empty() && is1x) drive.expectServing(snapshot.serving, active.front());
      if (HasFatalFailure()) return;
      const auto evdo = drive.world().evdo().serving();
      if (evdo && snapshot.second) {
        ++pairs;
        drive.expectServing(*snapshot.second, *evdo);
      }
      if (HasFatalFailure()) return;
      drive.expectTrue(snapshot.cells);
      if (HasFatalFailure()) return;
    }
    EXPECT_GT(pairs, 100U);
    EXPECT_GT(drive.checked(), 1000U);
  }
}

}  // namespace
}  // namespace kelvasi::cockpit
