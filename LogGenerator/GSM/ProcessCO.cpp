// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ProcessCO.h"

#include "LogGenerator/GSM/MMState.h"
#include "LogGenerator/GSM/RegistrationState.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{mmState::logCode, registrationState::logCode};

constexpr std::array mmRows{
    Row{.key = "MM State",
        .quantity = quantity::mmState,
        .field = indexIn(mmState::layout, "state"),
        .texts = mmState::states},
};
constexpr std::array records{
    RecordRows{mmState::logCode, mmState::minimumLength, mmState::layout, mmRows},
    registrationState::serviceState,
};

// The trace names another section; tools that filter the system log know it so.
constexpr StateSection section{
    .name = "Process CO", .trace = "ProcessCS", .logCodes = logCodes, .records = records};

}  // namespace

ProcessCO::ProcessCO(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
