// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/BLER.h"

#include "LogGenerator/GSM/TransportChannelCRC.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{transportChannelCrc::logCode};
constexpr StateSection section{.name = "BLER", .trace = "BLER", .logCodes = logCodes};

}  // namespace

BLER::BLER(const Platform& platform) : StateDecoder(platform, section) {}

Outcome BLER::decodeOther(RecordView record, LogCode logCode) {
  using namespace transportChannelCrc;
  if (logCode != transportChannelCrc::logCode) return StateDecoder::decodeOther(record, logCode);
  if (record.size() < minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  show(record, layout, rows, writer);
  channels_.show(record, channels, channelRows, "Transport Channels", *sectionRows(), place());
  return Outcome::shown;
}

}  // namespace kelvasi
