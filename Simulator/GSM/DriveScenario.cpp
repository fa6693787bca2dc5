#include "Simulator/GSM/DriveScenario.h"

#include <array>

#include "Simulator/GSM/CellSetRecords.h"
#include "Simulator/GSM/GprsRecords.h"
#include "Simulator/GSM/GsmRecords.h"
#include "Simulator/GSM/RegistrationRecords.h"
#include "Simulator/GSM/SimRecord.h"
#include "Simulator/GSM/UmtsRecords.h"

namespace kelvasi::sim::gsm {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

template <Record (*encode)(const World&)>
Record of(const World& world, const PlistSerialiser&) {
  return encode(world);
}
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
  return simFilesRecord(plists);
}

// The daemon's own records first: where a section shows both, the baseband's record is the later one.
constexpr std::array rules{
    Rule{.encode = ofSim, .atMostEvery = 24h, .atLeastEvery = 24h},
    Rule{.encode = ofCellList, .atMostEvery = 2s},
    Rule{.encode = ofContexts, .atMostEvery = 2s},
    Rule{.encode = ofRegistration<registrationStateRecord>},
    Rule{.encode = ofRegistration<mmStateRecord>},
    Rule{.encode = ofRegistration<gmmStateRecord>},
    Rule{.encode = ofRegistration<registeredPlmnRecord>},
    Rule{.encode = ofRegistration<equivalentPlmnRecord>},
    Rule{.encode = of<rrcStateRecord>},
    Rule{.encode = of<umtsServingCellRecord>},
    Rule{.encode = of<cipheringRecord>},
    Rule{.encode = of<transmitPowerRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<cellSetsRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<neighbourSetsRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<hsdpaRecord>},
    Rule{.encode = of<blockErrorRecord>},
    Rule{.encode = of<rrStateRecord>},
    Rule{.encode = of<gsmCellIdentityRecord>},
    Rule{.encode = of<bsicListRecord>},
    Rule{.encode = of<gsmMeasurementsRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<dedicatedChannelRecord>},
    Rule{.encode = of<mobileAllocationRecord>},
    Rule{.encode = of<dtxRecord>},
    Rule{.encode = of<si13Record>},
    Rule{.encode = of<packetAccessRecord>},
    Rule{.encode = of<gprsCellOptionsRecord>},
    Rule{.encode = of<pbcchRecord>},
    Rule{.encode = of<packetStatusRecord>},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : world_(Random(seed)), feed_(rules, plists) {}

void DriveScenario::step(Messages& messages) {
  const auto before = world_.situation();
  now_ += stepLength();
  world_.pass(std::chrono::duration<double>(stepLength()).count());
  feed_.advance(now_, world_, world_.situation() != before, messages);
}

}  // namespace kelvasi::sim::gsm
