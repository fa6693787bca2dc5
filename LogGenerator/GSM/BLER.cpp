#include "LogGenerator/GSM/BLER.h"

#include "LogGenerator/GSM/TransportChannelCRC.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{transportChannelCrc::logCode};
constexpr StateSection section{.name = "BLER", .trace = "BLER", .logCodes = logCodes};

}  // namespace

BLER::BLER(const Platform& platform) : StateDecoder(platform, section) {}

void BLER::decodeOther(RecordView record, LogCode logCode) {
  using namespace transportChannelCrc;
  if (logCode != transportChannelCrc::logCode) return logUnknownMessage(logCode);
  if (record.size() < minimumLength || !sectionRows()) return;
  RowWriter writer(*sectionRows());
  show(record, layout, rows, writer);
  channels_.show(record, channels, channelRows, "Transport Channels", *sectionRows());
}

}  // namespace kelvasi
