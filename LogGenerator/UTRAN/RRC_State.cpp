// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/RRC_State.h"

#include "LogGenerator/RowWriter.h"
#include "LogGenerator/UTRAN/RRCState.h"
#include "Plist/Description.h"

namespace kelvasi {

namespace {

using namespace utran;

constexpr std::array logCodes{rrcState::logCode};
constexpr std::int64_t noMode = 255;

// A record of another version says nothing of the state.
constexpr Row stateRow{.key = "State",
                       .quantity = quantity::rrcState,
                       .field = indexIn(rrcState::layout, "mode"),
                       .special = ValueText{noMode, rrcState::unknownMode},
                       .texts = rrcState::modes,
                       .otherwise = rrcState::unknownMode};

std::int64_t modeOf(RecordView record) {
  const auto version = valueOf(record, fieldIn(rrcState::layout, "layout version"));
  return version == rrcState::knownVersion ? rawOf(record, rrcState::layout, stateRow) : noMode;
}

}  // namespace

std::span<const LogCode> RRC_State::getLogCodeArray() const {
  return logCodes;
}

void RRC_State::describe(RowCatalog& catalog) const {
  catalog.add(getSectionName(), {rrcState::logCode, rrcState::layout, std::span(&stateRow, 1)});
}

std::optional<std::size_t> RRC_State::versionAt(LogCode) const {
  return fieldIn(rrcState::layout, "layout version").byte;
}

Outcome RRC_State::updateWithData(RecordView record, LogCode logCode) {
  trace("RRC Info");
  if (logCode != rrcState::logCode) return Outcome::notAskedFor;
  // A short record is read on with what it lacks as zero.
  if (record.size() < rrcState::expectedLength) {
    log().print(LogPriority::warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
                static_cast<long>(record.size()), static_cast<long>(rrcState::expectedLength));
  }
  const std::int64_t mode = modeOf(record);
  if (sectionRows()) RowWriter(*sectionRows(), place()).write(stateRow, mode);
  if (log().wants(LogPriority::warning)) traceDisplay(mode, textOf(stateRow, mode));
  return rowsOutcome();
}

void RRC_State::traceDisplay(std::int64_t mode, const std::string& text) const {
  log().print(LogPriority::warning, "Display Dict = %s, rrc mode = %d %s", description(sectionRef()).c_str(),
              static_cast<int>(mode), text.c_str());
}

}  // namespace kelvasi
