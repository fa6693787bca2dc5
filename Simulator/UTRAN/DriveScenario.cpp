// SPDX-License-Identifier: Apache-2.0
#include "Simulator/UTRAN/DriveScenario.h"

#include <array>

#include "Simulator/Daemon/PdpContextRecord.h"
#include "Simulator/Daemon/SimRecord.h"
#include "Simulator/Daemon/WorldCells.h"
#include "Simulator/UTRAN/CellLayout.h"
#include "Simulator/UTRAN/UtranRecords.h"

namespace kelvasi::sim::utran {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

Record ofCellList(const World& world, const PlistSerialiser& plists) {
  return cellInfoRecord(gsm::cellListOf(world), plists);
}
Record ofContexts(const World& world, const PlistSerialiser& plists) {
  return gsm::pdpContextRecord(world.registration().packetSwitched().contexts(), plists);
}
Record ofSim(const World&, const PlistSerialiser& plists) {
  return gsm::simFilesRecord(plists, gsm::gsmAndUmts);
}

// The daemon's own records first: where a section shows both, the baseband's record is the later one.
constexpr std::array rules{
    Rule{.encode = ofSim, .atMostEvery = 24h, .atLeastEvery = 24h},
    Rule{.encode = ofCellList, .atMostEvery = 2s},
    Rule{.encode = ofContexts, .atMostEvery = 2s},
    Rule{.encode = recordOf<rrcStateRecord>},
    Rule{.encode = recordOf<servingCellRecord>},
    Rule{.encode = recordOf<neighborCellsRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<gsmNeighborCellsRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<channelMeasurementRecord>, .atMostEvery = 400ms},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : Drive(rules, plists, Random(seed), layOutCells) {}

}  // namespace kelvasi::sim::utran
