// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/CellChangeCounters.h"

namespace kelvasi {

namespace {
constexpr StateSection section{.name = "Cell Change Counters", .trace = "CellChangeCounters", .logCodes = {}};
}  // namespace

CellChangeCounters::CellChangeCounters(const Platform& platform) : RecordlessDecoder(platform, section) {}

}  // namespace kelvasi
