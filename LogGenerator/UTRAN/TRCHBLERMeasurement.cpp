// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"

#include "LogGenerator/UTRAN/ChannelMeasurement.h"

namespace kelvasi {

namespace {

using namespace utran;
using channelMeasurement::transportLayout;

constexpr std::array logCodes{channelMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "TRCH ID",
        .quantity = quantity::channelId,
        .field = indexIn(transportLayout, "TRCH identity")},
    Row{.key = "TRCH BLER Measurement",
        .quantity = quantity::bler,
        .field = indexIn(transportLayout, "BLER measurement")},
};

constexpr ListSection section{.name = "TRCH BLER",
                              .trace = "TRCH BLER Measurement",
                              .tracePriority = LogPriority::notice,
                              .logCodes = logCodes,
                              .logCode = channelMeasurement::logCode,
                              .minimumLength = channelMeasurement::minimumLength,
                              .list = channelMeasurement::transportChannels,
                              .rows = rows};

}  // namespace

TRCHBLERMeasurement::TRCHBLERMeasurement(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
