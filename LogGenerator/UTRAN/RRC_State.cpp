#include "LogGenerator/UTRAN/RRC_State.h"

#include "LogGenerator/RowWriter.h"
#include "LogGenerator/UTRAN/RRCState.h"
#include "Plist/Description.h"

namespace kelvasi {

namespace {

using namespace utran;

constexpr std::array logCodes{rrcState::logCode};
constexpr std::int64_t noMode = 255;

std::int64_t modeOf(RecordView record) {
  const auto value = [&](std::size_t field) { return valueOf(record, rrcState::layout[field]); };
  const bool isKnown = value(indexIn(rrcState::layout, "layout version")) == rrcState::knownVersion;
  return isKnown ? value(indexIn(rrcState::layout, "mode")) : noMode;
}

std::string_view textOf(std::int64_t mode) {
  const auto place = static_cast<std::size_t>(mode);
  return place < rrcState::modes.size() ? rrcState::modes[place] : rrcState::unknownMode;
}

}  // namespace

std::span<const LogCode> RRC_State::getLogCodeArray() const {
  return logCodes;
}

void RRC_State::updateWithData(RecordView record, LogCode logCode) {
  trace("RRC Info");
  if (logCode != rrcState::logCode) return;
  // A short record is read on with what it lacks as zero.
  if (record.size() < rrcState::expectedLength) {
    log().print(LogPriority::warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
                static_cast<long>(record.size()), static_cast<long>(rrcState::expectedLength));
  }
  const std::int64_t mode = modeOf(record);
  const std::string_view text = textOf(mode);
  if (sectionRows()) RowWriter(*sectionRows()).text("State", text);
  if (log().wants(LogPriority::warning)) traceDisplay(mode, text);
}

void RRC_State::traceDisplay(std::int64_t mode, std::string_view text) const {
  log().print(LogPriority::warning, "Display Dict = %s, rrc mode = %d %s", description(sectionRef()).c_str(),
              static_cast<int>(mode), text.data());
}

}  // namespace kelvasi
