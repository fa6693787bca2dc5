// SPDX-License-Identifier: Apache-2.0
#include "Radio/ChannelRange.h"
#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr Frequency raster = 200_kHz;

// General channels: on whole steps of 200 kHz from 2.4 MHz above the band's edge.
constexpr ChannelRange general(Band band, ChannelSpan downlink, ChannelSpan uplink) {
  return {band, downlink, uplink, raster};
}
// Additional channels: in the middle of blocks of 5 MHz.
constexpr ChannelRange additional(Band band, ChannelSpan downlink, ChannelSpan uplink) {
  return {band, downlink, uplink, raster, 25};
}
// An additional channel that stands for itself.
constexpr ChannelRange single(Band band, std::uint32_t downlink, Frequency downlinkFrequency,
                              std::uint32_t uplink, Frequency uplinkFrequency) {
  return {band, {downlink, downlink, downlinkFrequency}, {uplink, uplink, uplinkFrequency}, raster};
}

constexpr ChannelSpan none{};

constexpr Band i{1, "Band I"};
constexpr Band ii{2, "Band II"};
constexpr Band iii{3, "Band III"};
constexpr Band iv{4, "Band IV"};
constexpr Band v{5, "Band V"};
constexpr Band vi{6, "Band VI"};
constexpr Band vii{7, "Band VII"};
constexpr Band viii{8, "Band VIII"};
constexpr Band ix{9, "Band IX"};
constexpr Band x{10, "Band X"};
constexpr Band xi{11, "Band XI"};
constexpr Band xii{12, "Band XII"};
constexpr Band xiii{13, "Band XIII"};
constexpr Band xiv{14, "Band XIV"};
constexpr Band xix{19, "Band XIX"};
constexpr Band xx{20, "Band XX"};
constexpr Band xxi{21, "Band XXI"};
constexpr Band xxii{22, "Band XXII"};
constexpr Band xxv{25, "Band XXV"};
constexpr Band xxvi{26, "Band XXVI"};
constexpr Band xxxii{32, "Band XXXII"};

constexpr std::array table{
    general(i, {10562, 10838, 2112.4_MHz}, {9612, 9888, 1922.4_MHz}),
    general(ii, {9662, 9938, 1932.4_MHz}, {9262, 9538, 1852.4_MHz}),
    additional(ii, {412, 687, 1932.5_MHz}, {12, 287, 1852.5_MHz}),
    general(iii, {1162, 1513, 1807.4_MHz}, {937, 1288, 1712.4_MHz}),
    general(iv, {1537, 1738, 2112.4_MHz}, {1312, 1513, 1712.4_MHz}),
    additional(iv, {1887, 2087, 2112.5_MHz}, {1662, 1862, 1712.5_MHz}),
    general(v, {4357, 4458, 871.4_MHz}, {4132, 4233, 826.4_MHz}),
    single(v, 1007, 871.5_MHz, 782, 826.5_MHz),
    single(v, 1012, 872.5_MHz, 787, 827.5_MHz),
    single(v, 1032, 876.5_MHz, 807, 831.5_MHz),
    single(v, 1037, 877.5_MHz, 812, 832.5_MHz),
    single(v, 1062, 882.5_MHz, 837, 837.5_MHz),
    single(v, 1087, 887.5_MHz, 862, 842.5_MHz),
    general(vi, {4387, 4413, 877.4_MHz}, {4162, 4188, 832.4_MHz}),
    additional(vi, {1037, 1062, 877.5_MHz}, {812, 837, 832.5_MHz}),
    general(vii, {2237, 2563, 2622.4_MHz}, {2012, 2338, 2502.4_MHz}),
    additional(vii, {2587, 2912, 2622.5_MHz}, {2362, 2687, 2502.5_MHz}),
    general(viii, {2937, 3088, 927.4_MHz}, {2712, 2863, 882.4_MHz}),
    general(ix, {9237, 9387, 1847.4_MHz}, {8762, 8912, 1752.4_MHz}),
    general(x, {3112, 3388, 2112.4_MHz}, {2887, 3163, 1712.4_MHz}),
    additional(x, {3412, 3687, 2112.5_MHz}, {3187, 3462, 1712.5_MHz}),
    general(xi, {3712, 3787, 1478.4_MHz}, {3487, 3562, 1430.4_MHz}),
    general(xii, {3842, 3903, 731.4_MHz}, {3617, 3678, 701.4_MHz}),
    single(xii, 3932, 731.5_MHz, 3707, 701.5_MHz),
    single(xii, 3957, 736.5_MHz, 3732, 706.5_MHz),
    single(xii, 3962, 737.5_MHz, 3737, 707.5_MHz),
    single(xii, 3987, 742.5_MHz, 3762, 712.5_MHz),
    single(xii, 3992, 743.5_MHz, 3767, 713.5_MHz),
    general(xiii, {4017, 4043, 748.4_MHz}, {3792, 3818, 779.4_MHz}),
    additional(xiii, {4067, 4092, 748.5_MHz}, {3842, 3867, 779.5_MHz}),
    general(xiv, {4117, 4143, 760.4_MHz}, {3892, 3918, 790.4_MHz}),
    additional(xiv, {4167, 4192, 760.5_MHz}, {3942, 3967, 790.5_MHz}),
    general(xix, {712, 763, 877.4_MHz}, {312, 363, 832.4_MHz}),
    additional(xix, {787, 837, 877.5_MHz}, {387, 437, 832.5_MHz}),
    general(xx, {4512, 4638, 793.4_MHz}, {4287, 4413, 834.4_MHz}),
    general(xxi, {862, 912, 1498.4_MHz}, {462, 512, 1450.4_MHz}),
    general(xxii, {4662, 5038, 3512.4_MHz}, {4437, 4813, 3412.4_MHz}),
    general(xxv, {5112, 5413, 1932.4_MHz}, {4887, 5188, 1852.4_MHz}),
    additional(xxv, {6292, 6592, 1932.5_MHz}, {6067, 6367, 1852.5_MHz}),
    general(xxvi, {5762, 5913, 861.4_MHz}, {5537, 5688, 816.4_MHz}),
    general(xxxii, {6617, 6813, 1454.4_MHz}, none),
    additional(xxxii, {6837, 7012, 1454.5_MHz}, none),
};

}  // namespace

Carriers utraFddCarriers(std::uint32_t uarfcn, LinkDirection direction) {
  const bool isDownlink = direction == LinkDirection::downlink;
  return carriersIn(table, uarfcn, isDownlink ? &ChannelRange::downlink : &ChannelRange::uplink);
}

}  // namespace kelvasi
