// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/DriveScenario.h"

#include <array>

#include "Simulator/Daemon/PdpContextRecord.h"
#include "Simulator/Daemon/SimRecord.h"
#include "Simulator/LTE/LteRecords.h"

namespace kelvasi::sim::lte {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

Record ofCellList(const World& world, const PlistSerialiser& plists) {
  return cellInfoRecord(cellListOf(world), plists);
}
Record ofContexts(const World& world, const PlistSerialiser& plists) {
  return gsm::pdpContextRecord(world.attachment().contexts(), plists);
}
Record ofSim(const World&, const PlistSerialiser& plists) {
  return gsm::simFilesRecord(plists, gsm::gsmUmtsAndLte);
}

// The daemon's own records first: where a section shows both, the baseband's record is the later one.
constexpr std::array rules{
    Rule{.encode = ofSim, .atMostEvery = 24h, .atLeastEvery = 24h},
    Rule{.encode = ofCellList, .atMostEvery = 2s},
    Rule{.encode = ofContexts, .atMostEvery = 2s},
    Rule{.encode = recordOf<transmitAntennasRecord>},
    Rule{.encode = recordOf<servingCellRecord>},
    Rule{.encode = recordOf<servingCellMeasurementRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<neighborMeasurementRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<reselectionCandidatesRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<connectedModeMeasurementRecord>, .atMostEvery = 400ms},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : Drive(rules, plists, Random(seed)) {}

}  // namespace kelvasi::sim::lte
