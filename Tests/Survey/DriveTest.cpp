// SPDX-License-Identifier: Apache-2.0
// What the survey says of the simulated drives, beside their worlds.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iterator>
#include <map>

#include "LogGenerator/Base.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Simulator/C2K/CellLayout.h"
#include "Simulator/C2K/DriveScenario.h"
#include "Simulator/C2K/Strength.h"
#include "Simulator/GSM/DriveScenario.h"
#include "Simulator/Handset/CellLayout.h"
#include "Simulator/LTE/CellLayout.h"
#include "Simulator/LTE/DriveScenario.h"
#include "Simulator/Radio/Reported.h"
#include "Simulator/UTRAN/CellLayout.h"
#include "Simulator/UTRAN/DriveScenario.h"
#include "Survey/Survey.h"
#include "Telvon/Technology.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::survey {
namespace {

using namespace std::chrono_literals;
using sim::Technology;

constexpr int steps = 9000;  // half an hour
constexpr Arrival begin = std::chrono::hours(480000);

// What a value is in the world, give or take.
struct Truth {
  double value = 0;
  double tolerance = 0;
};

Truth between(double one, double other, double tolerance) {
  return {(one + other) / 2, std::abs(one - other) / 2 + tolerance};
}

// A cell of a world as the survey names it, and its place there.
struct Named {
  CellIdentity identity;
  std::size_t place = 0;
};

struct Gsm {
  using Scenario = sim::gsm::DriveScenario;
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_GSM;
  static std::vector<sim::Cell> cells(sim::Random random) { return sim::gsm::layOutCells(random.split()); }
  static void name(const sim::Cell& cell, std::size_t place, std::vector<Named>& names) {
    const bool isGsm = cell.technology == Technology::gsm;
    names.push_back({{isGsm ? RadioFamily::gsm : RadioFamily::umts, cell.frequency, cell.code}, place});
  }
  static std::optional<std::size_t> serving(const sim::gsm::World& world) { return world.serving(); }
  static std::optional<Truth> truth(const sim::gsm::World& world, const Named& cell,
                                    const Quantity& quantity) {
    // As handsets report it: the scales end before the air does.
    const sim::Reception& heard = world.reception(cell.place);
    const double level = sim::reportedGsmLevel(heard);
    if (&quantity == &quantity::rssi) return Truth{level, 2.1};  // the daemon counts in steps of 2 dB
    if (&quantity == &quantity::rxlev) return Truth{std::clamp(level + 110, 0.0, 63.0), 1.1};
    const double rscp = sim::reportedRscp(heard);
    const double ecNo = sim::reportedEcNo(heard);
    // One of the records goes through a ladder that bends far down.
    const double ladder = Base::lookUpECNO(static_cast<std::uint32_t>(524288 * std::pow(10, ecNo / 10)));
    if (&quantity == &quantity::rscp) return between(rscp, rscp + ladder - ecNo, 1.1);
    if (&quantity == &quantity::ecno) return between(ecNo, ladder, 0.6);
    return std::nullopt;
  }
};

struct Utran {
  using Scenario = sim::utran::DriveScenario;
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_UTRAN2;
  static std::vector<sim::Cell> cells(sim::Random random) { return sim::utran::layOutCells(random.split()); }
  static void name(const sim::Cell& cell, std::size_t place, std::vector<Named>& names) {
    if (cell.isTdd) names.push_back({{RadioFamily::utraTdd, cell.frequency, cell.code}, place});
  }
  // What serves in GSM is shown nowhere.
  static std::optional<std::size_t> serving(const sim::gsm::World& world) {
    return world.isOn(Technology::umts) ? world.serving() : std::nullopt;
  }
  static std::optional<Truth> truth(const sim::gsm::World& world, const Named& cell,
                                    const Quantity& quantity) {
    const double level = std::clamp(world.reception(cell.place).level + 116, 0.0, 91.0);
    if (&quantity == &quantity::rscpLevel) return Truth{level / 256, 0.6 / 256};
    return std::nullopt;
  }
};

struct Lte {
  using Scenario = sim::lte::DriveScenario;
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_LTE;
  static std::vector<sim::Cell> cells(sim::Random random) { return sim::lte::layOutCells(random.split()); }
  static void name(const sim::Cell& cell, std::size_t place, std::vector<Named>& names) {
    const RadioFamily family = cell.technology == Technology::lte   ? RadioFamily::lte
                               : cell.technology == Technology::gsm ? RadioFamily::gsm
                                                                    : RadioFamily::umts;
    names.push_back({{family, cell.frequency, cell.code}, place});
  }
  static std::optional<std::size_t> serving(const sim::lte::World& world) {
    return world.isOnLte() ? world.serving() : std::nullopt;
  }
  // Records hold what is measured and what is averaged: one of the two it must
  // be.
  static std::optional<Truth> truth(const sim::lte::World& world, const Named& cell,
                                    const Quantity& quantity) {
    const sim::Reception& now = world.reception(cell.place);
    const sim::Reception& average = world.average(cell.place);
    if (&quantity == &quantity::rsrp)
      return between(std::clamp(now.level, -140.0, -44.0), std::clamp(average.level, -140.0, -44.0), 0.3);
    if (&quantity == &quantity::rsrq)
      return between(std::clamp(now.ecNo, -19.5, -3.0), std::clamp(average.ecNo, -19.5, -3.0), 0.3);
    if (&quantity == &quantity::rssi) return Truth{world.rssi(cell.place), 0.3};
    return std::nullopt;
  }
};

struct C2k {
  static constexpr double steps1x = 1.5e-5;  // of the energy in the record
  using Scenario = sim::c2k::DriveScenario;
  static constexpr std::string_view technology = kTelvonLogChannelTechnology_Orvane_CDMA;
  static std::vector<sim::Cell> cells(sim::Random random) { return sim::c2k::layOutCells(random.split()); }
  static void name(const sim::Cell& cell, std::size_t place, std::vector<Named>& names) {
    names.push_back({{RadioFamily::cdma, sim::c2k::oneXChannel, cell.code}, place});
    names.push_back({{RadioFamily::evdo, sim::c2k::evdoChannel, cell.code}, place});
  }
  static std::optional<Truth> truth(const sim::c2k::World& world, const Named& cell,
                                    const Quantity& quantity) {
    if (&quantity != &quantity::ecio) return std::nullopt;
    if (cell.identity.family == RadioFamily::cdma) {
      const double ratio = std::pow(10, sim::c2k::reportedRatio(world.oneXRatios()[cell.place]) / 10);
      const auto decibel = [](double linear) { return 10 * std::log10(std::max(linear, 1e-5)); };
      return between(decibel(ratio - steps1x), decibel(ratio + steps1x), 0.01);
    }
    const auto strength = static_cast<double>(sim::c2k::strengthOf(world.evdoRatios()[cell.place]));
    return Truth{10 * std::log10(strength / 512), 0.01};
  }
};

PlistValue displayTemplate(const std::string& name) {
  std::ifstream file(KELVASI_RESOURCES_DIRECTORY "/" + name + ".plist", std::ios::binary);
  const Bytes bytes(std::istreambuf_iterator<char>(file), {});
  return LibplistSerialiser().parse(bytes).value_or(PlistValue());
}

template <typename Kind>
class SurveyedDrive {
 public:
  explicit SurveyedDrive(std::uint64_t seed) : scenario_(seed, plists_), survey_(setUp()) {
    for (const char* name : {"Orvane_GSM", "LTE", "UTRAN", "C2KTemplate"})
      surroundings_.resources.files[std::string(name) + ".plist"] =
          plists_.serialiseXml(displayTemplate(name)).value();
    surroundings_.log.isMasked = true;
    generator_ = LogGenerator::generatorFromTechnology(Kind::technology, platform());
    generator_->gatherInto(&readings_);
    const auto cells = Kind::cells(sim::Random(seed));
    for (std::size_t place = 0; place < cells.size(); ++place) Kind::name(cells[place], place, names_);
    cells_ = cells;
  }

  void step() {
    sim::Messages messages;
    scenario_.step(messages);
    now_ += scenario_.stepLength();
    for (const sim::Message& message : messages) {
      generator_->setArrival(now_);
      generator_->updateState(*state_, message.bytes);
      survey_.take(readings_, generator_->intake());
      look();
      if (testing::Test::HasFatalFailure()) return;
    }
  }

  const auto& world() const { return scenario_.world(); }
  const sim::Cell& cell(std::size_t place) const { return cells_[place]; }
  const Survey& survey() const { return survey_; }
  std::size_t count(EventKind kind) const { return events_.contains(kind) ? events_.at(kind) : 0; }
  std::uint64_t checked() const { return checked_; }

  // The one cell of the world that it can be.
  const Named* named(const CellIdentity& identity) const {
    const auto isSame = [&](const Named& each) { return canBeSame(each.identity, identity); };
    const auto found = std::ranges::find_if(names_, isSame);
    if (found == names_.end() || std::ranges::count_if(names_, isSame) != 1) return nullptr;
    return &*found;
  }

 private:
  SurveySetUp setUp() {
    SurveySetUp result;
    result.keepsSeries = false;
    result.onEvent = [this](const Event& event) { ++events_[event.kind]; };
    return result;
  }
  Platform platform() {
    return {surroundings_.log, surroundings_.trace, plists_, surroundings_.resources, surroundings_.clock};
  }

  // Each level that came now is that of its cell in the world.
  void look() {
    for (const SeenCell& cell : survey_.cells().all()) {
      for (const CellLevel& level : cell.levels()) {
        if (level.lastTime == now_) expectTrue(cell, level);
      }
    }
  }

  void expectTrue(const SeenCell& cell, const CellLevel& level) {
    const Named* named = this->named(cell.identity);
    ASSERT_TRUE(named) << "there is no cell " << textOf(cell.identity);
    const auto truth = Kind::truth(world(), *named, *level.quantity);
    if (!truth) return;
    ++checked_;
    ASSERT_NEAR(level.last, truth->value, truth->tolerance)
        << textOf(cell.identity) << " " << level.quantity->id << " by record " << std::hex
        << readings_.logCode();
  }

  kelvasi::test::TestPlatform surroundings_;
  LibplistSerialiser plists_;
  typename Kind::Scenario scenario_;
  std::vector<sim::Cell> cells_;
  std::vector<Named> names_;
  Readings readings_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
  std::map<EventKind, std::size_t> events_;
  Survey survey_;
  Arrival now_ = begin;
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
