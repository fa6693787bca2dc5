// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"

#include "LogGenerator/UTRAN/ChannelMeasurement.h"

namespace kelvasi {

namespace {

using namespace utran;
using channelMeasurement::compositeLayout;

constexpr std::array logCodes{channelMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "CCTRCH ID",
        .quantity = quantity::channelId,
        .field = indexIn(compositeLayout, "CCTRCH identity")},
    Row{.key = "TSNUM", .quantity = quantity::timeslot, .field = indexIn(compositeLayout, "timeslot number")},
};

constexpr std::array ratioRows{
    Row{.key = "SIR", .quantity = quantity::sir, .field = indexIn(compositeLayout, "SIR 0")},
};
constexpr std::array others{
    RecordPart{channelMeasurement::logCode, compositeLayout, ratioRows, "entry", ratioRows.front().key}};

constexpr ListSection section{.name = "CCTRCH SIR",
                              .trace = "CCTRCH SIR Measurement",
                              .logCodes = logCodes,
                              .logCode = channelMeasurement::logCode,
                              .minimumLength = channelMeasurement::minimumLength,
                              .list = channelMeasurement::compositeChannels,
                              .rows = rows,
                              .isSilent = true,
                              .others = others};

}  // namespace

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement(const Platform& platform) : ListDecoder(platform, section) {}

void CCTRCHSIRMeasurement::addEntry(RecordView record, std::size_t place) {
  const RecordView channel = entry(record, place);
  RowWriter row = addRows();
  show(channel, compositeLayout, rows, row);
  PlistArray& ratios = row.list(ratioRows.front().key);
  for (std::size_t timeslot = 0; timeslot < channelMeasurement::timeslots; ++timeslot)
    row.element(ratios, ratioRows.front(), channelMeasurement::ratioOf(channel, timeslot));
}

}  // namespace kelvasi
