// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/UMTSRRInfo.h"

#include <cstdio>
#include <limits>

#include "LogGenerator/GSM/UMTSRRRecords.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using namespace std::string_view_literals;

constexpr auto uarfcnKey = "UARFCN"sv;

constexpr std::array logCodes{rrcState::logCode, transmitPower::logCode, umtsServingCell::logCode,
                              ciphering::logCode, cellInfoLogCode};
// The mean of the samples.
constexpr std::array powerRows{
    Row{.key = "Transmit Power",
        .quantity = quantity::txPower,
        .unit = " dBm",
        .scale = Scale{.curve = fromRaw}},
};
constexpr std::array parts{
    RecordPart{
        .logCode = transmitPower::logCode, .rows = powerRows, .minimumLength = transmitPower::minimumLength},
    RecordPart{.logCode = transmitPower::logCode,
               .layout = transmitPower::sampleLayout,
               .of = "entry",
               .minimumLength = transmitPower::minimumLength,
               .entries = &transmitPower::samples},
    RecordPart{.logCode = umtsServingCell::logCode,
               .layout = umtsServingCell::layout,
               .rows = umtsServingCell::cellRows,
               .minimumLength = umtsServingCell::minimumLength},
    RecordPart{.logCode = umtsServingCell::logCode,
               .layout = umtsServingCell::layout,
               .rows = umtsServingCell::areaRows,
               .minimumLength = umtsServingCell::minimumLength},
};

constexpr std::array records{rrcState::record, ciphering::record};

constexpr std::array cellRows{
    CellRow{{.key = "Cell ID", .quantity = quantity::cellId},
            kTelvonCellMonitorCellId,
            "UMTSRRInfo: Failed to retrieve Cell ID\n"},
    CellRow{{.key = uarfcnKey, .quantity = quantity::uarfcn},
            kTelvonCellMonitorUARFCN,
            "UMTSRRInfo: Failed to retrieve UARFCN\n"},
    CellRow{{.key = "Scrambling Code", .quantity = quantity::scramblingCode},
            kTelvonCellMonitorSCN,
            "UMTSRRInfo: Failed to retrieve Scrambling Code\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS};
constexpr CellTable servingCell{technologies,
                                kTelvonCellMonitorCellTypeServing,
                                cellRows,
                                {RadioFamily::umts, kTelvonCellMonitorUARFCN, kTelvonCellMonitorSCN}};

constexpr StateSection section{.name = "UMTS RR Info",
                               .trace = "UMTSRRInfo",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell,
                               .role = CellRole::serving,
                               .others = parts};

// The mean of the samples in dBm. Not a number when there is none: 0/0, whose sign differs from processor to
// processor and would show.
double meanPower(RecordView record) {
  double sum = 0;
  double count = 0;
  for (std::size_t place = 0; place < countOf(record, transmitPower::samples); ++place) {
    const RecordView sample = entryOf(record, transmitPower::samples, place);
    const std::int64_t agc = valueOf(sample, fieldIn(transmitPower::sampleLayout, "transmit AGC"));
    if (agc == 0) continue;
    const std::int64_t wholeDbm = (agc + 512) / 10 - 70;
    sum += static_cast<double>(wholeDbm);
    ++count;
  }
  return count == 0 ? std::numeric_limits<double>::quiet_NaN() : sum / count;
}

}  // namespace

UMTSRRInfo::UMTSRRInfo(const Platform& platform) : StateDecoder(platform, section) {}

Outcome UMTSRRInfo::decodeOther(RecordView record, LogCode logCode) {
  if (logCode == transmitPower::logCode) return showTransmitPower(record);
  if (logCode == umtsServingCell::logCode) return showServingCell(record);
  return StateDecoder::decodeOther(record, logCode);
}

Outcome UMTSRRInfo::showTransmitPower(RecordView record) const {
  if (record.size() < transmitPower::minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter(*sectionRows(), place()).write(powerRows.front(), rawOf(meanPower(record)));
  return Outcome::shown;
}

// The two frequencies take the place of the UARFCN, until the cell list brings that again.
Outcome UMTSRRInfo::showServingCell(RecordView record) const {
  if (record.size() < umtsServingCell::minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  show(record, umtsServingCell::layout, umtsServingCell::cellRows, writer);
  writer.remove(uarfcnKey);
  show(record, umtsServingCell::layout, umtsServingCell::areaRows, writer);
  if (readings())
    writer.identify(
        servingCellOf(umtsServingCell::cell, record, umtsServingCell::logCode, readings()->servingCells()));
  return Outcome::shown;
}

}  // namespace kelvasi
