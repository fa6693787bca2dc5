// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/DetectedSet.h"

#include "LogGenerator/GSM/HollowSet.h"

namespace kelvasi {

namespace {
constexpr ListSection section = hollowSet("Detected Set", "DetectedSet");
}

DetectedSet::DetectedSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
