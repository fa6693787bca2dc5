#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"

#include "LogGenerator/UTRAN/ChannelMeasurement.h"

namespace kelvasi {

namespace {

using namespace utran;
using channelMeasurement::compositeLayout;

constexpr std::array logCodes{channelMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "CCTRCH ID", .field = indexIn(compositeLayout, "CCTRCH identity")},
    Row{.key = "TSNUM", .field = indexIn(compositeLayout, "timeslot number")},
};

constexpr ListSection section{.name = "CCTRCH SIR",
                              .trace = "CCTRCH SIR Measurement",
                              .logCodes = logCodes,
                              .logCode = channelMeasurement::logCode,
                              .minimumLength = channelMeasurement::minimumLength,
                              .list = channelMeasurement::compositeChannels,
                              .rows = rows};

}  // namespace

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement(const Platform& platform) : ListDecoder(platform, section) {}

void CCTRCHSIRMeasurement::addEntry(RecordView record, std::size_t place) {
  const RecordView channel = entry(record, place);
  const auto ratios = PlistArray::make();
  for (std::size_t timeslot = 0; timeslot < channelMeasurement::timeslots; ++timeslot)
    ratios->append(std::to_string(channelMeasurement::ratioOf(channel, timeslot)));
  RowWriter row = addRows();
  show(channel, compositeLayout, rows, row);
  row.value("SIR", ratios);
}

}  // namespace kelvasi
