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
constexpr std::array records{rrcState::record, ciphering::record};

constexpr std::array cellRows{
    CellRow{"Cell ID", kTelvonCellMonitorCellId, "UMTSRRInfo: Failed to retrieve Cell ID\n"},
    CellRow{uarfcnKey, kTelvonCellMonitorUARFCN, "UMTSRRInfo: Failed to retrieve UARFCN\n"},
    CellRow{"Scrambling Code", kTelvonCellMonitorSCN, "UMTSRRInfo: Failed to retrieve Scrambling Code\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS};
constexpr CellTable servingCell{technologies, kTelvonCellMonitorCellTypeServing, cellRows};

constexpr StateSection section{.name = "UMTS RR Info",
                               .trace = "UMTSRRInfo",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell};

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

void UMTSRRInfo::decodeOther(RecordView record, LogCode logCode) {
  if (logCode == transmitPower::logCode) return showTransmitPower(record);
  if (logCode == umtsServingCell::logCode) return showServingCell(record);
  logUnknownMessage(logCode);
}

void UMTSRRInfo::showTransmitPower(RecordView record) const {
  if (record.size() < transmitPower::minimumLength || !sectionRows()) return;
  std::array<char, 32> text;
  const int length = std::snprintf(text.data(), text.size(), "%4.2f dBm", meanPower(record));
  RowWriter(*sectionRows()).text("Transmit Power", {text.data(), static_cast<std::size_t>(length)});
}

// The two frequencies take the place of the UARFCN, until the cell list brings that again.
void UMTSRRInfo::showServingCell(RecordView record) const {
  if (record.size() < umtsServingCell::minimumLength || !sectionRows()) return;
  RowWriter writer(*sectionRows());
  show(record, umtsServingCell::layout, umtsServingCell::cellRows, writer);
  sectionRows()->remove(uarfcnKey);
  show(record, umtsServingCell::layout, umtsServingCell::areaRows, writer);
}

}  // namespace kelvasi
