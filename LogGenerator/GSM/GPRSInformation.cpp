// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GPRSInformation.h"

#include "LogGenerator/GSM/GPRSCellOptions.h"
#include "LogGenerator/GSM/GPRSRecords.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/RegisteredPLMN.h"

namespace kelvasi {

namespace {

using namespace std::string_view_literals;

constexpr std::array logCodes{packetAccess::logCode,   registeredPlmn::logCode, gprsCellOptions::logCode,
                              pbcch::logCode,          packetStatus::logCode,   si13::logCode,
                              gsmMeasurements::logCode};

constexpr std::array operatingModes{"Class 1"sv, "Class 2"sv, "Class 3"sv};
constexpr std::array plmnRows{
    Row{.key = "Network Operating Mode",
        .quantity = quantity::operatingMode,
        .field = indexIn(registeredPlmn::layout, "network operating mode"),
        .texts = operatingModes},
};

constexpr std::array waits{"500 ms"sv, "1000 ms"sv, "1500 ms"sv, "0 ms"sv,
                           "80 ms"sv,  "120 ms"sv,  "160 ms"sv,  "200 ms"sv};
constexpr std::array burstTypes{"8-bit format"sv, "11-bit format"sv};
constexpr std::array optionRows{
    Row{.key = "T3192",
        .quantity = quantity::cellOption,
        .field = indexIn(gprsCellOptions::layout, "T3192"),
        .texts = waits,
        .otherwise = "?? ms"},
    Row{.key = "Access Burst Type",
        .quantity = quantity::cellOption,
        .field = indexIn(gprsCellOptions::layout, "access burst type"),
        .texts = burstTypes,
        .isFlag = true},
    Row{.key = "DRX Timer Max",
        .quantity = quantity::drxTimer,
        .field = indexIn(gprsCellOptions::layout, "DRX timer maximum")},
};

constexpr std::array hysteresisTexts{"Not Applied"sv, "Applied"sv};
constexpr std::array measurementRows{
    Row{.key = "Cell Reselect Hysteresis",
        .quantity = quantity::cellOption,
        .field = indexIn(gsmMeasurements::layout, "reselect hysteresis"),
        .texts = hysteresisTexts,
        .isFlag = true},
};

constexpr std::array records{
    si13::record,
    packetAccess::record,
    RecordRows{registeredPlmn::logCode, registeredPlmn::minimumLength, registeredPlmn::layout, plmnRows},
    RecordRows{gprsCellOptions::logCode, gprsCellOptions::minimumLength, gprsCellOptions::layout, optionRows},
    pbcch::record,
    packetStatus::record,
    RecordRows{gsmMeasurements::logCode, gsmMeasurements::minimumLength, gsmMeasurements::layout,
               measurementRows},
};

constexpr StateSection section{
    .name = "GPRS Information", .trace = "GPRSInformation", .logCodes = logCodes, .records = records};

}  // namespace

GPRSInformation::GPRSInformation(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
