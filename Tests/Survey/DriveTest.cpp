// SPDX-License-Identifier: Apache-2.0
// What the survey says of the simulated drives, beside their worlds.
#include <gtest/gtest.h>

#include <map>

#include "Survey/Survey.h"
#include "Tests/Survey/Worlds.h"

namespace kelvasi::survey {
namespace {

using test::C2k;
using test::Gsm;
using test::Lte;
using test::Named;
using test::Utran;

constexpr int steps = 9000;  // half an hour

template <typename Kind>
class SurveyedDrive {
 public:
  explicit SurveyedDrive(std::uint64_t seed)
      : survey_(setUp()), drive_(seed, [this](const Readings& readings, const Intake& intake) {
          survey_.take(readings, intake);
          look(readings.logCode());
          return !testing::Test::HasFatalFailure();
        }) {}

  void step() { drive_.step(); }
  const auto& world() const { return drive_.world(); }
  const sim::Cell& cell(std::size_t place) const { return drive_.cell(place); }
  const Named* named(const CellIdentity& identity) const { return drive_.named(identity); }
  const Survey& survey() const { return survey_; }
  std::size_t count(EventKind kind) const { return events_.contains(kind) ? events_.at(kind) : 0; }
  std::uint64_t checked() const { return checked_; }

 private:
  SurveySetUp setUp() {
    SurveySetUp result;
    result.keepsSeries = false;
    result.onEvent = [this](const Event& event) { ++events_[event.kind]; };
    return result;
  }

  // Each level that came now is that of its cell in the world.
  void look(LogCode logCode) {
    for (const SeenCell& cell : survey_.cells().all()) {
      for (const CellLevel& level : cell.levels()) {
        if (level.lastTime == drive_.now()) expectTrue(cell, level, logCode);
      }
    }
  }

  void expectTrue(const SeenCell& cell, const CellLevel& level, LogCode logCode) {
    const Named* named = this->named(cell.identity);
    ASSERT_TRUE(named) << "there is no cell " << textOf(cell.identity);
    const auto truth = Kind::truth(world(), *named, *level.quantity);
    if (!truth) return;
    ++checked_;
    ASSERT_NEAR(level.last, truth->value, truth->tolerance)
        << textOf(cell.identity) << " " << level.quantity->id << " by record " << std::hex << logCode;
  }

  std::map<EventKind, std::size_t> events_;
  Survey survey_;
  test::WorldDrive<Kind> drive_;
  std::uint64_t checked_ = 0;
};

template <typename Kind>
class Drive : public testing::Test {};

using Kinds = testing::Types<Gsm, Utran, Lte>;
TYPED_TEST_SUITE(Drive, Kinds);

// At each moment the cell that serves in the world is the one that the survey
// shows, under its name; every level is its cell's; and each change of cell is
// an event.
TYPED_TEST(Drive, IsWhatTheWorldIs) {
  for (const std::uint64_t seed : {1u, 11u, 2024u}) {
    SCOPED_TRACE(seed);
    SurveyedDrive<TypeParam> drive(seed);
    std::optional<std::size_t> last;
    std::size_t changes = 0;
    std::size_t changesOfRat = 0;
    for (int turn = 0; turn < steps; ++turn) {
      SCOPED_TRACE(turn);
      drive.step();
      if (testing::Test::HasFatalFailure()) return;
      const auto serving = TypeParam::serving(drive.world());
      if (!serving) continue;
      if (last && *last != *serving) {
        ++changes;
        if (drive.cell(*last).technology != drive.cell(*serving).technology) ++changesOfRat;
      }
      last = serving;
      const SeenCell* shown = drive.survey().cells().serving();
      ASSERT_TRUE(shown);
      const Named* named = drive.named(shown->identity);
      ASSERT_TRUE(named) << textOf(shown->identity);
      ASSERT_EQ(named->place, *serving) << textOf(shown->identity);
      ASSERT_EQ(shown->names.cellId, drive.cell(*serving).id);
    }
    EXPECT_GT(changes, 5U);
    EXPECT_EQ(drive.count(EventKind::cellChange), changes);
    EXPECT_EQ(drive.count(EventKind::ratChange), changesOfRat);
    EXPECT_GT(drive.checked(), 10000U);
    this->RecordProperty("levels", static_cast<int>(drive.checked()));
  }
}

// Names are those of the world, however a cell came to be known.
TYPED_TEST(Drive, NamesStayWithTheirCells) {
  SurveyedDrive<TypeParam> drive(7);
  for (int turn = 0; turn < steps && !testing::Test::HasFatalFailure(); ++turn) drive.step();
  std::size_t named = 0;
  for (const SeenCell& cell : drive.survey().cells().all()) {
    if (!cell.names.cellId) continue;
    ++named;
    ASSERT_TRUE(drive.named(cell.identity));
    const sim::Cell& truth = drive.cell(drive.named(cell.identity)->place);
    EXPECT_EQ(cell.names.cellId, truth.id);
    EXPECT_EQ(cell.names.area.value_or(truth.locationArea.code), truth.locationArea.code);
    EXPECT_EQ(cell.names.mnc.value_or(truth.locationArea.plmn.mnc), truth.locationArea.plmn.mnc);
  }
  EXPECT_GT(named, 3U);
}

// 1x and EV-DO each have a cell that serves.
TEST(CdmaDrive, IsWhatTheWorldIs) {
  for (const std::uint64_t seed : {1u, 11u, 2024u}) {
    SCOPED_TRACE(seed);
    SurveyedDrive<C2k> drive(seed);
    std::optional<std::size_t> lastOneX;
    std::optional<std::size_t> lastEvdo;
    std::size_t changes = 0;
    const auto compare = [&](RadioFamily family, std::size_t serving, std::optional<std::size_t>& last) {
      if (last && *last != serving) ++changes;
      last = serving;
      const SeenCell* shown = drive.survey().cells().serving(family);
      ASSERT_TRUE(shown);
      ASSERT_TRUE(drive.named(shown->identity)) << textOf(shown->identity);
      ASSERT_EQ(drive.named(shown->identity)->place, serving) << textOf(shown->identity);
    };
    for (int turn = 0; turn < steps; ++turn) {
      SCOPED_TRACE(turn);
      drive.step();
      if (HasFatalFailure()) return;
      const auto& active = drive.world().oneX().pilots().active();
      if (!active.empty()) compare(RadioFamily::cdma, active.front(), lastOneX);
      if (drive.world().evdo().serving())
        compare(RadioFamily::evdo, *drive.world().evdo().serving(), lastEvdo);
    }
    EXPECT_GT(changes, 5U);
    EXPECT_EQ(drive.count(EventKind::cellChange), changes);
    EXPECT_EQ(drive.count(EventKind::ratChange), 0U);
    EXPECT_GT(drive.checked(), 10000U);
  }
}

}  // namespace
}  // namespace kelvasi::survey
