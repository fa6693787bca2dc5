// SPDX-License-Identifier: Apache-2.0
#include <span>

#include "Radio/ChannelRange.h"
#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr ChannelRange cdma(Band band, std::uint32_t first, std::uint32_t last, Frequency downlink,
                            Frequency uplink, Frequency raster) {
  return {band, {first, last, downlink}, {first, last, uplink}, raster};
}

constexpr Band bc0{0, "BC0"};
constexpr Band bc1{1, "BC1"};
constexpr Band bc2{2, "BC2"};
constexpr Band bc3{3, "BC3"};
constexpr Band bc4{4, "BC4"};
constexpr Band bc5{5, "BC5"};
constexpr Band bc6{6, "BC6"};
constexpr Band bc7{7, "BC7"};
constexpr Band bc8{8, "BC8"};
constexpr Band bc9{9, "BC9"};
constexpr Band bc10{10, "BC10"};
constexpr Band bc12{12, "BC12"};
constexpr Band bc13{13, "BC13"};
constexpr Band bc14{14, "BC14"};
constexpr Band bc15{15, "BC15"};

constexpr std::array table{
    cdma(bc0, 1, 799, 870.03_MHz, 825.03_MHz, 30_kHz),
    cdma(bc0, 991, 1023, 869.04_MHz, 824.04_MHz, 30_kHz),
    cdma(bc0, 1024, 1323, 860.04_MHz, 815.04_MHz, 30_kHz),
    cdma(bc1, 0, 1199, 1930_MHz, 1850_MHz, 50_kHz),
    cdma(bc2, 0, 1000, 934.9875_MHz, 889.9875_MHz, 25_kHz),
    cdma(bc2, 1329, 2047, 917.0125_MHz, 872.0125_MHz, 25_kHz),
    cdma(bc3, 1, 799, 860.0125_MHz, 915.0125_MHz, 12.5_kHz),
    cdma(bc3, 801, 1039, 843.0125_MHz, 898.0125_MHz, 12.5_kHz),
    cdma(bc3, 1041, 1199, 832.0125_MHz, 887.0125_MHz, 12.5_kHz),
    cdma(bc3, 1201, 1600, 838.0125_MHz, 893.0125_MHz, 12.5_kHz),
    cdma(bc4, 0, 599, 1840_MHz, 1750_MHz, 50_kHz),
    cdma(bc5, 1, 400, 460_MHz, 450_MHz, 25_kHz),
    cdma(bc5, 472, 871, 420_MHz, 410_MHz, 25_kHz),
    cdma(bc5, 1039, 1473, 461.31_MHz, 451.31_MHz, 20_kHz),
    cdma(bc5, 1536, 1715, 489_MHz, 479_MHz, 25_kHz),
    cdma(bc5, 1792, 2016, 489_MHz, 479_MHz, 20_kHz),
    cdma(bc6, 0, 1199, 2110_MHz, 1920_MHz, 50_kHz),
    cdma(bc7, 0, 240, 746_MHz, 776_MHz, 50_kHz),
    cdma(bc8, 0, 1499, 1805_MHz, 1710_MHz, 50_kHz),
    cdma(bc9, 0, 699, 925_MHz, 880_MHz, 50_kHz),
    cdma(bc10, 0, 719, 851_MHz, 806_MHz, 25_kHz),
    cdma(bc10, 720, 919, 935_MHz, 896_MHz, 25_kHz),
    cdma(bc12, 0, 239, 915.0125_MHz, 870.0125_MHz, 25_kHz),
    cdma(bc13, 0, 1399, 2620_MHz, 2500_MHz, 50_kHz),
    cdma(bc14, 0, 1299, 1930_MHz, 1850_MHz, 50_kHz),
    cdma(bc15, 0, 899, 2110_MHz, 1710_MHz, 50_kHz),
};

}  // namespace

Carriers cdmaCarriers(std::uint32_t channel) {
  return carriersIn(table, channel, &ChannelRange::downlink);
}

Carriers cdmaCarriers(std::uint32_t channel, std::uint32_t bandClass) {
  Carriers found;
  for (const Carrier& carrier : cdmaCarriers(channel)) {
    if (carrier.band.number == bandClass) found.add(carrier);
  }
  return found;
}

}  // namespace kelvasi
