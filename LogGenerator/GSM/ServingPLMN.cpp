#include "LogGenerator/GSM/ServingPLMN.h"

#include "LogGenerator/GSM/RegisteredPLMN.h"
#include "LogGenerator/GSM/RegistrationState.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using namespace std::string_view_literals;

constexpr auto mccKey = "Mobile Country Code"sv;
constexpr auto mncKey = "Mobile Network Code"sv;

constexpr std::array logCodes{registeredPlmn::logCode, registrationState::logCode, cellInfoLogCode};

constexpr std::array selectionModes{"Automatic"sv, "Manual"sv, "Limited"sv, "LIMITED_ROUTINE_ACQ"sv,
                                    "LIMITED_MANUAL_ACQ"sv};
constexpr std::array selectionRows{
    Row{.key = "PLMN Sel Mod",
        .field = indexIn(registrationState::layout, "PLMN selection mode"),
        .texts = selectionModes},
};
constexpr std::array records{
    RecordRows{registrationState::logCode, registrationState::minimumLength, registrationState::layout,
               selectionRows},
};

constexpr std::array cellRows{
    CellRow{mccKey, kTelvonCellMonitorMCC, "ServingPLMN: Failed to retrieve MCC\n"},
    CellRow{mncKey, kTelvonCellMonitorMNC, "ServingPLMN: Failed to retrieve MNC\n"},
    CellRow{"Location Area Code", kTelvonCellMonitorLAC, "ServingPLMN: Failed to retrieve LAC\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS,
                                  kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable servingCell{technologies, kTelvonCellMonitorCellTypeServing, cellRows};

constexpr StateSection section{.name = "Serving PLMN",
                               .trace = "Serving PLMN",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell};

// A filler digit shows as a blank, so a two-digit network code ends with one.
std::array<char, 3> digits(RecordView record, std::span<const std::size_t, 3> fields) {
  std::array<char, 3> text;
  for (std::size_t place = 0; place < text.size(); ++place) {
    const std::int64_t digit = valueOf(record, registeredPlmn::layout[fields[place]]);
    text[place] = digit < 10 ? static_cast<char>('0' + digit) : ' ';
  }
  return text;
}

}  // namespace

ServingPLMN::ServingPLMN(const Platform& platform) : StateDecoder(platform, section) {}

void ServingPLMN::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != registeredPlmn::logCode) return logUnknownMessage(logCode);
  if (record.size() < registeredPlmn::minimumLength || !sectionRows()) return;
  const auto mcc = digits(record, registeredPlmn::mccDigits);
  const auto mnc = digits(record, registeredPlmn::mncDigits);
  RowWriter writer(*sectionRows());
  writer.text(mccKey, {mcc.data(), mcc.size()});
  writer.text(mncKey, {mnc.data(), mnc.size()});
  show(record, registeredPlmn::layout, registeredPlmn::rows, writer);
}

}  // namespace kelvasi
