// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/EvdoRates.h"

#include <string>

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

std::int64_t forwardSent(RecordView record) {
  using namespace evdoForwardRate;
  std::int64_t sent = 0;
  for (std::size_t place = 0; place < weights.size(); ++place) {
    sent += record.u32(firstCounter + 4 * place) * weights[place];
  }
  return sent;
}

std::int64_t packetsOfRate(RecordView record, std::size_t rate) {
  using namespace evdoReverseRate;
  std::int64_t packets = 0;
  for (std::size_t subFrame = 0; subFrame < subFrames; ++subFrame) {
    for (std::size_t half = 0; half < halves; ++half) {
      const std::size_t base = firstCounter + subFrameStep * subFrame + halfStep * half + rateStep * rate;
      for (std::size_t counter = 0; counter < counters; ++counter) {
        packets += record.u32(base + counterStep * counter);
      }
    }
  }
  return packets;
}

std::int64_t reverseSent(RecordView record) {
  std::int64_t sent = 0;
  for (std::size_t rate = 0; rate < evdoReverseRate::weights.size(); ++rate) {
    sent += packetsOfRate(record, rate) * evdoReverseRate::weights[rate];
  }
  return sent;
}

constexpr Scale rateScale{.format = "%.2f", .curve = fromRaw};
constexpr Row forwardRow{
    .key = "kFLDataRate", .quantity = quantity::dataRate, .unit = " kbps", .absent = "", .scale = rateScale};
constexpr Row reverseRow{
    .key = "kRLDataRate", .quantity = quantity::dataRate, .unit = " kbps", .absent = "", .scale = rateScale};

// One link's row, and its names: "FL" or "RL" in front of the state's keys.
struct Link {
  const Row& row;
  std::string sequenceKey;
  std::string sentKey;
};

void showRate(const C2KUpdate& update, const Link& link, std::uint32_t sequence, std::int64_t sent) {
  const PlistValue sequenceBefore = update.state.get(link.sequenceKey);
  const PlistValue sentBefore = update.state.get(link.sentKey);
  if (sequenceBefore.integer() && sentBefore.integer()) {
    const auto steps =
        static_cast<std::int32_t>(sequence - static_cast<std::uint32_t>(*sequenceBefore.integer()));
    if (steps >= 1) {
      const auto bits = static_cast<double>(sent - *sentBefore.integer());
      update.write(link.row, rawOf(bits / (steps * 1024.0)));
    }
    update.setExtraInfo(link.sequenceKey + "2", sequenceBefore);
    update.setExtraInfo(link.sentKey + "2", sentBefore);
  } else {
    update.write(link.row, noValue);
  }
  update.state.set(link.sequenceKey, sequence);
  update.state.set(link.sentKey, sent);
  update.setExtraInfo(link.sequenceKey + "1", sequence);
  update.setExtraInfo(link.sentKey + "1", sent);
}

}  // namespace

std::span<const RecordPart> evdoForwardRate::parts() {
  static constexpr std::array shown{
      RecordPart{.logCode = evdoForwardRate::logCode, .rows = std::span(&forwardRow, 1)},
      RecordPart{evdoForwardRate::logCode, evdoForwardRate::layout}};
  return shown;
}

std::span<const RecordPart> evdoReverseRate::parts() {
  static constexpr std::array shown{
      RecordPart{.logCode = evdoReverseRate::logCode, .rows = std::span(&reverseRow, 1)},
      RecordPart{evdoReverseRate::logCode, evdoReverseRate::layout}};
  return shown;
}

Outcome evdoForwardRate::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x1192 is %d bytes long but must be at least %ld bytes."))
    return Outcome::tooShort;
  const auto sequence =
      static_cast<std::uint32_t>(valueOf(update.record, fieldIn(layout, "sequence number")));
  showRate(update, {forwardRow, "FLDataSeqNum", "FLDataSent"}, sequence, forwardSent(update.record));
  return Outcome::shown;
}

Outcome evdoReverseRate::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x127e is %d bytes long but must be at least %ld bytes."))
    return Outcome::tooShort;
  const auto sequence =
      static_cast<std::uint32_t>(valueOf(update.record, fieldIn(layout, "sequence number")));
  showRate(update, {reverseRow, "RLDataSeqNum", "RLDataSent"}, sequence, reverseSent(update.record));
  return Outcome::shown;
}

}  // namespace kelvasi
