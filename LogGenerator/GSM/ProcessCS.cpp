// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ProcessCS.h"

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
    Row{.key = "MM Sub State",
        .quantity = quantity::mmSubState,
        .field = indexIn(mmState::layout, "sub-state"),
        .texts = mmState::subStates},
    Row{.key = "LU Reject Cause",
        .quantity = quantity::mmUpdateStatus,
        .field = indexIn(mmState::layout, "update status"),
        .texts = mmState::updateStatuses},
};
constexpr std::array records{
    RecordRows{mmState::logCode, mmState::minimumLength, mmState::layout, mmRows},
    registrationState::serviceState,
};

constexpr StateSection section{
    .name = "Process CS", .trace = "ProcessCS", .logCodes = logCodes, .records = records};

}  // namespace

ProcessCS::ProcessCS(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
