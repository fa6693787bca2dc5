// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/DriveScenario.h"

#include <array>

#include "Simulator/Daemon/PdpContextRecord.h"
#include "Simulator/Daemon/SimRecord.h"
#include "Simulator/Daemon/WorldCells.h"
#include "Simulator/GSM/CellSetRecords.h"
#include "Simulator/GSM/GprsRecords.h"
#include "Simulator/GSM/GsmRecords.h"
#include "Simulator/GSM/RegistrationRecords.h"
#include "Simulator/GSM/UmtsRecords.h"

namespace kelvasi::sim::gsm {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

template <Bytes (*encode)(const Registration&)>
Record ofRegistration(const World& world, const PlistSerialiser&) {
  return encode(world.registration());
}
Record ofCellList(const World& world, const PlistSerialiser& plists) {
  return cellInfoRecord(cellListOf(world), plists);
}
Record ofContexts(const World& world, const PlistSerialiser& plists) {
  return pdpContextRecord(world.registration().packetSwitched().contexts(), plists);
}
Record ofSim(const World&, const PlistSerialiser& plists) {
  return simFilesRecord(plists, gsmAndUmts);
}

// The daemon's own records first: where a section shows both, the baseband's record is the later one. On GSM
// it is the other way round with the ranked cells, as that record empties the section of the UMTS neighbours,
// of which only the daemon's list tells there.
constexpr std::array rules{
    Rule{.encode = ofSim, .atMostEvery = 24h, .atLeastEvery = 24h},
    Rule{.encode = recordOf<rankedGsmCellsRecord>, .atMostEvery = 2s},
    Rule{.encode = ofCellList, .atMostEvery = 2s, .followsTheOneBefore = true},
    Rule{.encode = ofContexts, .atMostEvery = 2s},
    Rule{.encode = ofRegistration<registrationStateRecord>},
    Rule{.encode = ofRegistration<mmStateRecord>},
    Rule{.encode = ofRegistration<gmmStateRecord>},
    Rule{.encode = ofRegistration<registeredPlmnRecord>},
    Rule{.encode = ofRegistration<equivalentPlmnRecord>},
    Rule{.encode = recordOf<rrcStateRecord>},
    Rule{.encode = recordOf<umtsServingCellRecord>},
    Rule{.encode = recordOf<cipheringRecord>},
    Rule{.encode = recordOf<transmitPowerRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<cellSetsRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<rankedUmtsCellsRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<hsdpaRecord>},
    Rule{.encode = recordOf<blockErrorRecord>},
    Rule{.encode = recordOf<rrStateRecord>},
    Rule{.encode = recordOf<gsmCellIdentityRecord>},
    Rule{.encode = recordOf<bsicListRecord>},
    Rule{.encode = recordOf<gsmMeasurementsRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<dedicatedChannelRecord>},
    Rule{.encode = recordOf<mobileAllocationRecord>},
    Rule{.encode = recordOf<dtxRecord>},
    Rule{.encode = recordOf<si13Record>},
    Rule{.encode = recordOf<packetAccessRecord>},
    Rule{.encode = recordOf<gprsCellOptionsRecord>},
    Rule{.encode = recordOf<pbcchRecord>},
    Rule{.encode = recordOf<packetStatusRecord>},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : Drive(rules, plists, Random(seed)) {}

}  // namespace kelvasi::sim::gsm
