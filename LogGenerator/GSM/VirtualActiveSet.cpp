// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/VirtualActiveSet.h"

#include "LogGenerator/GSM/HollowSet.h"

namespace kelvasi {

namespace {
constexpr ListSection section = hollowSet("Virtual Active Set", "VirtualActiveSet");
}

VirtualActiveSet::VirtualActiveSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
