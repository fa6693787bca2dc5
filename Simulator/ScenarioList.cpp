// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ScenarioList.h"

#include <algorithm>
#include <array>

#include "Simulator/C2K/DriveScenario.h"
#include "Simulator/GSM/DriveScenario.h"
#include "Simulator/GSM/MobilityScenario.h"
#include "Simulator/LTE/DriveScenario.h"
#include "Simulator/ObjectStream/ObjectStreamScenario.h"
#include "Simulator/UTRAN/DriveScenario.h"
#include "Telvon/Technology.h"

namespace kelvasi::sim {

namespace {

template <typename Kind>
std::unique_ptr<Scenario> make(std::uint64_t seed, const PlistSerialiser& plists) {
  return std::make_unique<Kind>(seed, plists);
}

constexpr std::array kinds{
    ScenarioKind{kTelvonLogChannelTechnology_IFX, "drive",
                 "a drive through GSM and UMTS cells; a property list a second, XML and binary in turn",
                 make<objectStream::ObjectStreamScenario>},
    ScenarioKind{kTelvonLogChannelTechnology_Orvane_GSM, "drive",
                 "a drive through a town of GSM and UMTS cells; all records", make<gsm::DriveScenario>},
    ScenarioKind{kTelvonLogChannelTechnology_Orvane_GSM, "mobility",
                 "registration, calls, data and loss of service; mobility management only",
                 make<gsm::MobilityScenario>},
    ScenarioKind{kTelvonLogChannelTechnology_Orvane_LTE, "drive",
                 "a drive through a town of LTE, UMTS and GSM cells; all records", make<lte::DriveScenario>},
    ScenarioKind{kTelvonLogChannelTechnology_Orvane_UTRAN2, "drive",
                 "a drive through a town of UTRA TDD and GSM cells; all records", make<utran::DriveScenario>},
    ScenarioKind{kTelvonLogChannelTechnology_Orvane_CDMA, "drive",
                 "a drive through a town of 1x and EV-DO base stations; all records",
                 make<c2k::DriveScenario>},
};

}  // namespace

std::span<const ScenarioKind> scenarioKinds() {
  return kinds;
}

const ScenarioKind* findScenario(std::string_view technology, std::string_view name) {
  const auto kind = std::ranges::find_if(kinds, [&](const ScenarioKind& candidate) {
    return candidate.technology == technology && (name.empty() || candidate.name == name);
  });
  return kind == kinds.end() ? nullptr : &*kind;
}

}  // namespace kelvasi::sim
