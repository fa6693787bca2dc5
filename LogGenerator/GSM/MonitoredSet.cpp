// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/MonitoredSet.h"

#include "LogGenerator/GSM/HollowSet.h"

namespace kelvasi {

namespace {
constexpr ListSection section = hollowSet("Monitored Set", "MonitoredSet");
}

MonitoredSet::MonitoredSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
