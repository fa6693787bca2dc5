// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/DriveScenario.h"

#include <array>

#include "Simulator/C2K/EvdoRecords.h"
#include "Simulator/C2K/Frames.h"
#include "Simulator/C2K/OneXRecords.h"

namespace kelvasi::sim::c2k {

namespace {

using namespace std::chrono_literals;
using Rule = RecordRule<World>;

constexpr std::array rules{
    Rule{.encode = recordOf<systemParametersRecord>},
    Rule{.encode = recordOf<deviceStatusRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<fingersRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<evdoStatusRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<evdoActiveSetRecord>, .atMostEvery = 400ms},
    Rule{.encode = recordOf<forwardRateRecord>},
    Rule{.encode = recordOf<reverseRateRecord>},
};

}  // namespace

DriveScenario::DriveScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : Drive(rules, plists, Random(seed)) {}

// In the order in which they were received, the last of them now.
void DriveScenario::tellOfTheStep(Messages& messages) const {
  const auto& frames = world().oneX().frames();
  auto at = now() - std::chrono::duration_cast<WorldTime>(
                        std::chrono::duration<double>(frameSeconds * static_cast<double>(frames.size())));
  for (const bool isError : frames) {
    at += std::chrono::duration_cast<WorldTime>(std::chrono::duration<double>(frameSeconds));
    Bytes record = trafficFrameRecord(isError);
    stampRecord(record, at);
    messages.push_back(logMessage(std::move(record)));
  }
}

}  // namespace kelvasi::sim::c2k
