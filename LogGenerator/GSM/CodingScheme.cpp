// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/CodingScheme.h"

namespace kelvasi {

namespace {
// The trace names its sibling; tools that filter the system log know it so.
constexpr StateSection section{.name = "Coding Scheme", .trace = "CellChangeCounters", .logCodes = {}};
}  // namespace

CodingScheme::CodingScheme(const Platform& platform) : RecordlessDecoder(platform, section) {}

}  // namespace kelvasi
