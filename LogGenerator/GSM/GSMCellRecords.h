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
    Row{.key = "Cell ID", .field = indexIn(layout, "cell identity")},
    Row{.key = "ARFCN", .field = indexIn(layout, "ARFCN")},
    Row{.key = "BSIC", .field = indexIn(layout, "BSIC")},
};
inline constexpr RecordRows record{logCode, 26, layout, rows};

}  // namespace gsmCellIdentity

namespace dedicatedChannel {

inline constexpr LogCode logCode = 0x5076;
inline constexpr std::array layout{Field{.name = "dedicated ARFCN", .byte = 13, .width = 16}};

// The row shows the low byte alone.
inline constexpr std::array rows{
    Row{.key = "MA Dedicated ARFCN", .field = indexIn(layout, "dedicated ARFCN"), .lowBits = 8},
};
inline constexpr RecordRows record{logCode, 17, layout, rows};

}  // namespace dedicatedChannel

}  // namespace kelvasi
