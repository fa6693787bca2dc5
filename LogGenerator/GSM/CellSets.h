// SPDX-License-Identifier: Apache-2.0
// Record 0x417A: the WCDMA cells that the searcher follows, with the set that each belongs to and its energy.
#pragma once

#include <array>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi::cellSets {

inline constexpr LogCode logCode = 0x417A;
inline constexpr std::array logCodes{logCode};  // of every set
inline constexpr std::size_t minimumLength = 16;

inline constexpr std::array layout{
    Field{.name = "receive AGC", .byte = 13, .width = 16, .isSigned = true},
    Field{.name = "cells", .byte = 15},
};
static_assert(inWireOrder(layout));

inline constexpr std::array identityLayout{
    Field{.name = "scrambling code", .byte = 7, .width = 13},
    Field{.name = "set membership", .byte = 8, .bit = 5, .width = 3},
};
static_assert(inWireOrder(identityLayout));
inline constexpr std::int64_t activeSetMember = 0;

// Linear Ec/No, 524288 being 0 dB; the first that is not 0 counts.
inline constexpr std::array energyLayout{
    Field{.name = "energy 1", .byte = 32, .width = 32},
    Field{.name = "energy 2", .byte = 36, .width = 32},
    Field{.name = "energy 3", .byte = 40, .width = 32},
};
static_assert(inWireOrder(energyLayout));

inline constexpr EntryList identities{
    .count = fieldIn(layout, "cells"), .start = 16, .stride = 15, .layout = identityLayout};
// In the order of the identities, behind the last of them.
inline constexpr EntryList energies{.count = fieldIn(layout, "cells"),
                                    .start = identities.start,
                                    .stride = 44,
                                    .layout = energyLayout,
                                    .countBefore = identities.count,
                                    .bytesPerEntryBefore = identities.stride};

}  // namespace kelvasi::cellSets
