// SPDX-License-Identifier: Apache-2.0
// The worlds of the simulated drives: which cells there are, which serves, and what its levels truly are.
#pragma once

#include <algorithm>
#include <cmath>
#include <fstream>
#include <functional>
#include <iterator>
#include <memory>
#include <optional>
#include <string>
#include <vector>

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
#include "Telvon/Technology.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::test {

using sim::Technology;

// What a value is in the world, give or take.
struct Truth {
  double value = 0;
  double tolerance = 0;
};

inline Truth between(double one, double other, double tolerance) {
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

inline PlistValue displayTemplate(const std::string& name) {
  std::ifstream file(KELVASI_RESOURCES_DIRECTORY "/" + name + ".plist", std::ios::binary);
  const Bytes bytes(std::istreambuf_iterator<char>(file), {});
  return LibplistSerialiser().parse(bytes).value_or(PlistValue());
}

// A drive through one of them, its messages decoded one by one.
template <typename Kind>
class WorldDrive {
 public:
  static constexpr Arrival begin = std::chrono::hours(480000);
  // Gets what each message said, and whether to go on.
  using OnMessage = std::function<bool(const Readings& readings, const Intake& intake)>;

  WorldDrive(std::uint64_t seed, OnMessage onMessage)
      : scenario_(seed, plists_), cells_(Kind::cells(sim::Random(seed))), onMessage_(std::move(onMessage)) {
    for (const char* name : {"Orvane_GSM", "LTE", "UTRAN", "C2KTemplate"})
      surroundings_.resources.files[std::string(name) + ".plist"] =
          plists_.serialiseXml(displayTemplate(name)).value();
    surroundings_.log.isMasked = true;
    generator_ = LogGenerator::generatorFromTechnology(Kind::technology, platform());
    generator_->gatherInto(&readings_);
    for (std::size_t place = 0; place < cells_.size(); ++place) Kind::name(cells_[place], place, names_);
  }

  void step() {
    sim::Messages messages;
    scenario_.step(messages);
    now_ += scenario_.stepLength();
    for (const sim::Message& message : messages) {
      generator_->setArrival(now_);
      generator_->updateState(*state_, message.bytes);
      if (!onMessage_(readings_, generator_->intake())) return;
    }
  }

  Arrival now() const { return now_; }
  const auto& world() const { return scenario_.world(); }
  const sim::Cell& cell(std::size_t place) const { return cells_[place]; }

  // The one cell of the world that it can be.
  const Named* named(const CellIdentity& identity) const {
    const auto isSame = [&](const Named& each) { return canBeSame(each.identity, identity); };
    const auto found = std::ranges::find_if(names_, isSame);
    if (found == names_.end() || std::ranges::count_if(names_, isSame) != 1) return nullptr;
    return &*found;
  }

 private:
  Platform platform() {
    return {surroundings_.log, surroundings_.trace, plists_, surroundings_.resources, surroundings_.clock};
  }

  TestPlatform surroundings_;
  LibplistSerialiser plists_;
  typename Kind::Scenario scenario_;
  std::vector<sim::Cell> cells_;
  std::vector<Named> names_;
  OnMessage onMessage_;
  Readings readings_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
  Arrival now_ = begin;
};

}  // namespace kelvasi::test
