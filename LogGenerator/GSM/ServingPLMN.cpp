// SPDX-License-Identifier: Apache-2.0
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
        .quantity = quantity::plmnSelection,
        .field = indexIn(registrationState::layout, "PLMN selection mode"),
        .texts = selectionModes},
};
constexpr std::array records{
    RecordRows{registrationState::logCode, registrationState::minimumLength, registrationState::layout,
               selectionRows},
};

constexpr std::array cellRows{
    CellRow{{.key = mccKey, .quantity = quantity::mcc},
            kTelvonCellMonitorMCC,
            "ServingPLMN: Failed to retrieve MCC\n"},
    CellRow{{.key = mncKey, .quantity = quantity::mnc},
            kTelvonCellMonitorMNC,
            "ServingPLMN: Failed to retrieve MNC\n"},
    CellRow{{.key = "Location Area Code", .quantity = quantity::lac},
            kTelvonCellMonitorLAC,
            "ServingPLMN: Failed to retrieve LAC\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUMTS,
                                  kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable servingCell{technologies, kTelvonCellMonitorCellTypeServing, cellRows};

// A filler digit shows as a blank, so a two-digit network code ends with one. Each begins with its first
// digit's field.
constexpr std::array digitRows{
    Row{.key = mccKey,
        .quantity = quantity::mcc,
        .field = indexIn(registeredPlmn::layout, "MCC digit 1"),
        .digits = 3},
    Row{.key = mncKey,
        .quantity = quantity::mnc,
        .field = indexIn(registeredPlmn::layout, "MNC digit 1"),
        .digits = 3},
};
constexpr std::array parts{
    RecordPart{.logCode = registeredPlmn::logCode,
               .layout = registeredPlmn::layout,
               .rows = digitRows,
               .digits = 3,
               .minimumLength = registeredPlmn::minimumLength},
    RecordPart{.logCode = registeredPlmn::logCode,
               .layout = registeredPlmn::layout,
               .rows = registeredPlmn::rows,
               .minimumLength = registeredPlmn::minimumLength},
};

constexpr StateSection section{.name = "Serving PLMN",
                               .trace = "Serving PLMN",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &servingCell,
                               .others = parts};

std::int64_t packed(RecordView record, std::span<const std::size_t, 3> fields) {
  const auto digit = [&](std::size_t place) {
    return valueOf(record, registeredPlmn::layout[fields[place]]) << (4 * place);
  };
  return digit(0) | digit(1) | digit(2);
}

}  // namespace

ServingPLMN::ServingPLMN(const Platform& platform) : StateDecoder(platform, section) {}

Outcome ServingPLMN::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != registeredPlmn::logCode) return StateDecoder::decodeOther(record, logCode);
  if (record.size() < registeredPlmn::minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  writer.write(digitRows[0], packed(record, registeredPlmn::mccDigits));
  writer.write(digitRows[1], packed(record, registeredPlmn::mncDigits));
  show(record, registeredPlmn::layout, registeredPlmn::rows, writer);
  return Outcome::shown;
}

}  // namespace kelvasi
