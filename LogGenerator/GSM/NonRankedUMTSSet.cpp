// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/NonRankedUMTSSet.h"

namespace kelvasi {

namespace {
constexpr StateSection section{.name = "Non-Ranked UMTS Set", .trace = "NonRankedUMTSSet", .logCodes = {}};
}  // namespace

NonRankedUMTSSet::NonRankedUMTSSet(const Platform& platform) : RecordlessDecoder(platform, section) {}

}  // namespace kelvasi
