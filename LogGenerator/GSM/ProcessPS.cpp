// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ProcessPS.h"

#include "LogGenerator/GSM/GMMState.h"
#include "LogGenerator/GSM/RegistrationState.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{gmmState::logCode, registrationState::logCode};

constexpr std::array records{
    RecordRows{gmmState::logCode, gmmState::minimumLength, gmmState::layout, gmmState::rows},
    registrationState::serviceState,
};

constexpr StateSection section{
    .name = "Process PS", .trace = "ProcessPS", .logCodes = logCodes, .records = records};

}  // namespace

ProcessPS::ProcessPS(const Platform& platform) : StateDecoder(platform, section) {}

}  // namespace kelvasi
