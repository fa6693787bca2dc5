#include "Simulator/C2K/DriveScenario.h"

#include <array>

#include "Simulator/C2K/EvdoRecords.h"
#include "Simulator/C2K/Frames.h"
#include "Simulator/C2K/OneXRecords.h"

namespace kelvasi::sim::c2k {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;
using Record = std::optional<Bytes>;

template <Record (*encode)(const World&)>
Record of(const World& world, const PlistSerialiser&) {
  return encode(world);
}

constexpr std::array rules{
    Rule{.encode = of<systemParametersRecord>},
    Rule{.encode = of<deviceStatusRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<fingersRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<evdoStatusRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<evdoActiveSetRecord>, .atMostEvery = 400ms},
    Rule{.encode = of<forwardRateRecord>},
    Rule{.encode = of<reverseRateRecord>},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : world_(Random(seed)), feed_(rules, plists) {}

void DriveScenario::step(Messages& messages) {
  const auto before = world_.situation();
  now_ += stepLength();
  world_.pass(std::chrono::duration<double>(stepLength()).count());
  sendFrames(messages);
  feed_.advance(now_, world_, world_.situation() != before, messages);
}

// In the order in which they were received, the last of them now.
void DriveScenario::sendFrames(Messages& messages) const {
  const auto& frames = world_.oneX().frames();
  auto at = now_ - std::chrono::duration_cast<WorldTime>(
                       std::chrono::duration<double>(frameSeconds * static_cast<double>(frames.size())));
  for (const bool isError : frames) {
    at += std::chrono::duration_cast<WorldTime>(std::chrono::duration<double>(frameSeconds));
    Bytes record = trafficFrameRecord(isError);
    stampRecord(record, at);
    messages.push_back(logMessage(std::move(record)));
  }
}

}  // namespace kelvasi::sim::c2k
