// SPDX-License-Identifier: Apache-2.0
// The pilots of the 1x active set with their Ec/Io.
#pragma once

#include <array>

#include "LogGenerator/C2K/PilotList.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RecordView.h"

namespace kelvasi {

// Calculated; the second one is the reference pilot's.
inline constexpr std::array activeSet1xRows{
    Row{.key = "k1xActiveSetInfo", .quantity = quantity::ecio, .unit = " dB", .scale = decibelScale},
    Row{.key = "k1xActiveSetInfo",
        .quantity = quantity::ecio,
        .before = "(ref pilot) ",
        .unit = " dB",
        .scale = decibelScale},
};

// Makes `pilots` those of the active-set sub-packet. `channel` is theirs.
void gatherActiveSet1x(RecordView subPacket, std::int64_t channel, PilotList& pilots);

// The cell of the reference pilot; none without pilots.
CellIdentity referenceCell(RecordView subPacket, std::int64_t channel);

}  // namespace kelvasi
