// SPDX-License-Identifier: Apache-2.0
// Events and alarms as records.
#pragma once

#include <span>
#include <string_view>

#include "Survey/Alarms/AlarmWatch.h"
#include "Survey/Events/Event.h"
#include "Tools/Kelvasictl/RecordOutput.h"

namespace kelvasi {

std::span<const Column> eventColumns();
// `technology` by its short name.
Json eventRecord(const survey::Event& event, std::string_view technology);

std::span<const Column> alarmColumns();
Json alarmRecord(const survey::Alarm& alarm, std::string_view technology);
// "rsrp < -115 for 10s: -116.5 dBm, lte:3350/404"
std::string alarmText(const survey::Alarm& alarm);

}  // namespace kelvasi
