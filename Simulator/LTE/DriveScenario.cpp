#include "Simulator/LTE/DriveScenario.h"

#include <array>

#include "Simulator/GSM/RegistrationRecords.h"
#include "Simulator/GSM/SimRecord.h"
#include "Simulator/LTE/LteRecords.h"

namespace kelvasi::sim::lte {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

template <Record (*encode)(const World&)>
Record of(const World& world, const PlistSerialiser&) {
  return encode(world);
}
Record ofCellList(const World& world, const PlistSerialiser& plists) {
  return cellInfoRecord(cellListOf(world), plists);
}
Record ofContexts(const World& world, const PlistSerialiser& plists) {
  return gsm::pdpContextRecord(world.attachment().contexts(), plists);
}
Record ofSim(const World&, const PlistSerialiser& plists) {
  return gsm::simFilesRecord(plists, "GSM, UMTS and LTE");
}

// The daemon's own records first: where a section shows both, the baseband's record is the later one.
constexpr std::array rules{
    Rule{.encode = ofSim, .atMostEvery = 24h, .atLeastEvery = 24h},
    Rule{.encode = ofCellList, .atMostEvery = 2s},
    Rule{.encode = ofContexts, .atMostEvery = 2s},
    Rule{.encode = of<transmitAntennasRecord>},
    Rule{.encode = of<servingCellRecord>},
    Rule{.encode = of<servingCellMeasurementRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<neighborMeasurementRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<reselectionCandidatesRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<connectedModeMeasurementRecord>, .atMostEvery = 400ms},
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

}  // namespace kelvasi::sim::lte
