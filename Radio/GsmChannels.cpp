// SPDX-License-Identifier: Apache-2.0
#include "Radio/ChannelRange.h"
#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr ChannelRange gsm(Band band, std::uint32_t first, std::uint32_t last, Frequency downlink,
                           Frequency uplink) {
  return {band, {first, last, downlink}, {first, last, uplink}, 200_kHz};
}

constexpr std::array table{
    gsm({450, "GSM 450"}, 259, 293, 460.6_MHz, 450.6_MHz),
    gsm({480, "GSM 480"}, 306, 340, 489_MHz, 479_MHz),
    gsm({750, "GSM 750"}, 438, 511, 747.2_MHz, 777.2_MHz),
    gsm({850, "GSM 850"}, 128, 251, 869.2_MHz, 824.2_MHz),
    gsm({900, "P-GSM 900"}, 1, 124, 935.2_MHz, 890.2_MHz),
    gsm({900, "E-GSM 900"}, 0, 0, 935_MHz, 890_MHz),
    gsm({900, "E-GSM 900"}, 975, 1023, 925.2_MHz, 880.2_MHz),
    gsm({900, "R-GSM 900"}, 955, 974, 921.2_MHz, 876.2_MHz),
    gsm({900, "ER-GSM 900"}, 940, 954, 918.2_MHz, 873.2_MHz),
    gsm({1800, "DCS 1800"}, 512, 885, 1805.2_MHz, 1710.2_MHz),
    gsm({1900, "PCS 1900"}, 512, 810, 1930.2_MHz, 1850.2_MHz),
};

}  // namespace

Carriers gsmCarriers(std::uint32_t arfcn) {
  return carriersIn(table, arfcn, &ChannelRange::downlink);
}

}  // namespace kelvasi
