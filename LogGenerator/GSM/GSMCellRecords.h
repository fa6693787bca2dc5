// SPDX-License-Identifier: Apache-2.0
// The records of the GSM serving cell: its identity and the dedicated channel.
#pragma once

#include <array>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

namespace gsmCellIdentity {

inline constexpr LogCode logCode = 0x5134;
inline constexpr std::array layout{
    Field{.name = "ARFCN", .byte = 13, .width = 16},
    Field{.name = "BSIC", .byte = 15, .width = 16},
    Field{.name = "cell identity", .byte = 17, .width = 16},
};
static_assert(inWireOrder(layout));

inline constexpr std::array rows{
    Row{.key = "Cell ID", .quantity = quantity::cellId, .field = indexIn(layout, "cell identity")},
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(layout, "ARFCN")},
    Row{.key = "BSIC", .quantity = quantity::bsic, .field = indexIn(layout, "BSIC")},
};
inline constexpr CellFields cell{.family = RadioFamily::gsm,
                                 .channel = fieldIn(layout, "ARFCN"),
                                 .code = fieldIn(layout, "BSIC"),
                                 .cellId = fieldIn(layout, "cell identity"),
                                 .isServing = true};
inline constexpr RecordRows record{logCode, 26, layout, rows, cell};

}  // namespace gsmCellIdentity

namespace dedicatedChannel {

inline constexpr LogCode logCode = 0x5076;
inline constexpr std::array layout{Field{.name = "dedicated ARFCN", .byte = 13, .width = 16}};

// The row shows the low byte alone.
inline constexpr std::array rows{
    Row{.key = "MA Dedicated ARFCN",
        .quantity = quantity::arfcn,
        .field = indexIn(layout, "dedicated ARFCN"),
        .lowBits = 8},
};
inline constexpr RecordRows record{logCode, 17, layout, rows};

}  // namespace dedicatedChannel

}  // namespace kelvasi
