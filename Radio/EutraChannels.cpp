// SPDX-License-Identifier: Apache-2.0
#include <algorithm>
#include <array>

#include "Radio/ChannelRange.h"
#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr ChannelRange fdd(Band band, ChannelSpan downlink, ChannelSpan uplink) {
  return {band, downlink, uplink, 100_kHz};
}
constexpr ChannelRange tdd(Band band, ChannelSpan both) {
  return {band, both, both, 100_kHz};
}

constexpr ChannelSpan none{};  // of a band for downlinks only

constexpr std::array table{
    fdd({1, "B1"}, {0, 599, 2110_MHz}, {18000, 18599, 1920_MHz}),
    fdd({2, "B2"}, {600, 1199, 1930_MHz}, {18600, 19199, 1850_MHz}),
    fdd({3, "B3"}, {1200, 1949, 1805_MHz}, {19200, 19949, 1710_MHz}),
    fdd({4, "B4"}, {1950, 2399, 2110_MHz}, {19950, 20399, 1710_MHz}),
    fdd({5, "B5"}, {2400, 2649, 869_MHz}, {20400, 20649, 824_MHz}),
    fdd({6, "B6"}, {2650, 2749, 875_MHz}, {20650, 20749, 830_MHz}),
    fdd({7, "B7"}, {2750, 3449, 2620_MHz}, {20750, 21449, 2500_MHz}),
    fdd({8, "B8"}, {3450, 3799, 925_MHz}, {21450, 21799, 880_MHz}),
    fdd({9, "B9"}, {3800, 4149, 1844.9_MHz}, {21800, 22149, 1749.9_MHz}),
    fdd({10, "B10"}, {4150, 4749, 2110_MHz}, {22150, 22749, 1710_MHz}),
    fdd({11, "B11"}, {4750, 4949, 1475.9_MHz}, {22750, 22949, 1427.9_MHz}),
    fdd({12, "B12"}, {5010, 5179, 729_MHz}, {23010, 23179, 699_MHz}),
    fdd({13, "B13"}, {5180, 5279, 746_MHz}, {23180, 23279, 777_MHz}),
    fdd({14, "B14"}, {5280, 5379, 758_MHz}, {23280, 23379, 788_MHz}),
    fdd({17, "B17"}, {5730, 5849, 734_MHz}, {23730, 23849, 704_MHz}),
    fdd({18, "B18"}, {5850, 5999, 860_MHz}, {23850, 23999, 815_MHz}),
    fdd({19, "B19"}, {6000, 6149, 875_MHz}, {24000, 24149, 830_MHz}),
    fdd({20, "B20"}, {6150, 6449, 791_MHz}, {24150, 24449, 832_MHz}),
    fdd({21, "B21"}, {6450, 6599, 1495.9_MHz}, {24450, 24599, 1447.9_MHz}),
    fdd({22, "B22"}, {6600, 7399, 3510_MHz}, {24600, 25399, 3410_MHz}),
    fdd({23, "B23"}, {7500, 7699, 2180_MHz}, {25500, 25699, 2000_MHz}),
    fdd({24, "B24"}, {7700, 8039, 1525_MHz}, {25700, 26039, 1626.5_MHz}),
    fdd({25, "B25"}, {8040, 8689, 1930_MHz}, {26040, 26689, 1850_MHz}),
    fdd({26, "B26"}, {8690, 9039, 859_MHz}, {26690, 27039, 814_MHz}),
    fdd({27, "B27"}, {9040, 9209, 852_MHz}, {27040, 27209, 807_MHz}),
    fdd({28, "B28"}, {9210, 9659, 758_MHz}, {27210, 27659, 703_MHz}),
    fdd({29, "B29"}, {9660, 9769, 717_MHz}, none),
    fdd({30, "B30"}, {9770, 9869, 2350_MHz}, {27660, 27759, 2305_MHz}),
    fdd({31, "B31"}, {9870, 9919, 462.5_MHz}, {27760, 27809, 452.5_MHz}),
    fdd({32, "B32"}, {9920, 10359, 1452_MHz}, none),
    tdd({33, "B33"}, {36000, 36199, 1900_MHz}),
    tdd({34, "B34"}, {36200, 36349, 2010_MHz}),
    tdd({35, "B35"}, {36350, 36949, 1850_MHz}),
    tdd({36, "B36"}, {36950, 37549, 1930_MHz}),
    tdd({37, "B37"}, {37550, 37749, 1910_MHz}),
    tdd({38, "B38"}, {37750, 38249, 2570_MHz}),
    tdd({39, "B39"}, {38250, 38649, 1880_MHz}),
    tdd({40, "B40"}, {38650, 39649, 2300_MHz}),
    tdd({41, "B41"}, {39650, 41589, 2496_MHz}),
    tdd({42, "B42"}, {41590, 43589, 3400_MHz}),
    tdd({43, "B43"}, {43590, 45589, 3600_MHz}),
    tdd({44, "B44"}, {45590, 46589, 703_MHz}),
    tdd({45, "B45"}, {46590, 46789, 1447_MHz}),
    tdd({46, "B46"}, {46790, 54539, 5150_MHz}),
    tdd({47, "B47"}, {54540, 55239, 5855_MHz}),
    tdd({48, "B48"}, {55240, 56739, 3550_MHz}),
    tdd({49, "B49"}, {56740, 58239, 3550_MHz}),
    tdd({50, "B50"}, {58240, 59089, 1432_MHz}),
    tdd({51, "B51"}, {59090, 59139, 1427_MHz}),
    tdd({52, "B52"}, {59140, 60139, 3300_MHz}),
    tdd({53, "B53"}, {60140, 60254, 2483.5_MHz}),
    fdd({65, "B65"}, {65536, 66435, 2110_MHz}, {131072, 131971, 1920_MHz}),
    fdd({66, "B66"}, {66436, 67335, 2110_MHz}, {131972, 132671, 1710_MHz}),
    fdd({67, "B67"}, {67336, 67535, 738_MHz}, none),
    fdd({68, "B68"}, {67536, 67835, 753_MHz}, {132672, 132971, 698_MHz}),
    fdd({69, "B69"}, {67836, 68335, 2570_MHz}, none),
    fdd({70, "B70"}, {68336, 68585, 1995_MHz}, {132972, 133121, 1695_MHz}),
    fdd({71, "B71"}, {68586, 68935, 617_MHz}, {133122, 133471, 663_MHz}),
    fdd({72, "B72"}, {68936, 68985, 461_MHz}, {133472, 133521, 451_MHz}),
    fdd({73, "B73"}, {68986, 69035, 460_MHz}, {133522, 133571, 450_MHz}),
    fdd({74, "B74"}, {69036, 69465, 1475_MHz}, {133572, 134001, 1427_MHz}),
    fdd({75, "B75"}, {69466, 70315, 1432_MHz}, none),
    fdd({76, "B76"}, {70316, 70365, 1427_MHz}, none),
    fdd({85, "B85"}, {70366, 70545, 728_MHz}, {134002, 134181, 698_MHz}),
    fdd({87, "B87"}, {70546, 70595, 420_MHz}, {134182, 134231, 410_MHz}),
    fdd({88, "B88"}, {70596, 70645, 422_MHz}, {134232, 134281, 412_MHz}),
    fdd({103, "B103"}, {70646, 70655, 757_MHz}, {134282, 134291, 787_MHz}),
};

}  // namespace

Carriers eutraCarriers(std::uint32_t earfcn) {
  const Carriers found = carriersIn(table, earfcn, &ChannelRange::downlink);
  return found.empty() ? carriersIn(table, earfcn, &ChannelRange::uplink) : found;
}

std::optional<std::uint32_t> eutraUplinkNumber(std::uint32_t earfcn) {
  const auto range =
      std::ranges::find_if(table, [earfcn](const ChannelRange& one) { return one.downlink.has(earfcn); });
  if (range == table.end()) return std::nullopt;
  const std::uint32_t number = range->uplink.first + (earfcn - range->downlink.first);
  return range->uplink.has(number) ? std::optional(number) : std::nullopt;
}

}  // namespace kelvasi
