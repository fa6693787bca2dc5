// SPDX-License-Identifier: Apache-2.0
// Record 0xB186: the cells of any technology that are candidates for reselection.
#pragma once

#include <array>

#include "LogGenerator/StateDecoder.h"

namespace kelvasi::lte::reselectionCandidates {

inline constexpr LogCode logCode = 0xB186;
inline constexpr std::size_t minimumLength = 21;

inline constexpr std::array layout{
    Field{.name = "version", .byte = 13},
    Field{.name = "serving E-ARFCN", .byte = 15, .width = 16},
    Field{.name = "serving cell identity", .byte = 17, .width = 16},
    Field{.name = "candidates", .byte = 19, .width = 16},
};
static_assert(inWireOrder(layout));

inline constexpr CellFields serving{.family = RadioFamily::lte,
                                    .channel = fieldIn(layout, "serving E-ARFCN"),
                                    .code = fieldIn(layout, "serving cell identity")};

inline constexpr std::array candidateLayout{
    Field{.name = "priority", .byte = 0, .width = 16},
    Field{.name = "RAT type", .byte = 2, .width = 16},
};
static_assert(inWireOrder(candidateLayout));

// A candidate has up to eight bytes of its technology's own, yet the next one starts after four: the bytes of
// a candidate are read again as the head of the next.
inline constexpr EntryList candidates{.count = fieldIn(layout, "candidates"),
                                      .lowBits = 8,
                                      .start = 21,
                                      .stride = 4,
                                      .layout = candidateLayout};

// From here on in a candidate, by RAT type.
inline constexpr std::size_t ratSpecific = 4;
inline constexpr std::array lteLayout{
    Field{.name = "E-ARFCN", .byte = 0, .width = 16},
    Field{.name = "cell identity", .byte = 2, .bit = 7, .width = 9},
};
inline constexpr std::array utranLayout{
    Field{.name = "UARFCN", .byte = 0, .width = 16},
    Field{.name = "primary scrambling code", .byte = 2, .width = 16},
};
inline constexpr std::array geranLayout{
    Field{.name = "ARFCN", .byte = 0, .width = 16},
    Field{.name = "band", .byte = 2},
    Field{.name = "BSIC", .byte = 3},
};
inline constexpr std::array cdmaLayout{
    Field{.name = "band", .byte = 0},
    Field{.name = "channel", .byte = 4, .width = 16},
    Field{.name = "pilot", .byte = 6, .width = 16},
};
static_assert(inWireOrder(lteLayout) && inWireOrder(utranLayout));
static_assert(inWireOrder(geranLayout) && inWireOrder(cdmaLayout));

// The cell from which reselection looks for candidates.
inline constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "Serving EARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "serving E-ARFCN")},
    Row{.key = "Serving Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "serving cell identity")},
};
inline constexpr RecordRows servingRecord{logCode, minimumLength, layout, rows, serving};

}  // namespace kelvasi::lte::reselectionCandidates
