// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/UMTSRRMeasurement.h"

namespace kelvasi {

namespace {
constexpr StateSection section{.name = "UMTS RR Measurement", .trace = "UMTSRRMeasurement", .logCodes = {}};
}  // namespace

UMTSRRMeasurement::UMTSRRMeasurement(const Platform& platform) : RecordlessDecoder(platform, section) {}

}  // namespace kelvasi
