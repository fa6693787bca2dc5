// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/NonRankedGSMSet.h"

namespace kelvasi {

namespace {
constexpr StateSection section{.name = "Non-Ranked GSM Set", .trace = "NonRankedGSMSet", .logCodes = {}};
}  // namespace

NonRankedGSMSet::NonRankedGSMSet(const Platform& platform) : RecordlessDecoder(platform, section) {}

}  // namespace kelvasi
