// SPDX-License-Identifier: Apache-2.0
#include "Radio/ChannelRange.h"
#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr ChannelRange tdd(Band band, std::uint32_t first, std::uint32_t last) {
  const ChannelSpan span{first, last, 200_kHz * first};  // the number counts from 0 Hz
  return {band, span, span, 200_kHz};
}

// The bands have letters in the standard; a is two pieces.
constexpr std::array table{
    tdd({1, "TDD band a"}, 9504, 9596),   tdd({1, "TDD band a"}, 10054, 10121),
    tdd({2, "TDD band b"}, 9254, 9546),   tdd({2, "TDD band b"}, 9654, 9946),
    tdd({3, "TDD band c"}, 9554, 9646),   tdd({4, "TDD band d"}, 12854, 13096),
    tdd({5, "TDD band e"}, 11504, 11996), tdd({6, "TDD band f"}, 9404, 9596),
};

}  // namespace

Carriers utraTddCarriers(std::uint32_t uarfcn) {
  return carriersIn(table, uarfcn, &ChannelRange::downlink);
}

}  // namespace kelvasi
