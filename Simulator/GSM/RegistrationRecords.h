// The mobility-management records, from the registration that they report.
#pragma once

#include "Platform/PlistSerialiser.h"
#include "Simulator/GSM/Registration.h"

namespace kelvasi::sim::gsm {

Bytes gmmStateRecord(const Registration& registration);           // 0x7130
Bytes mmStateRecord(const Registration& registration);            // 0x7131
Bytes registrationStateRecord(const Registration& registration);  // 0x7132
Bytes registeredPlmnRecord(const Registration& registration);     // 0x7135
Bytes equivalentPlmnRecord(const Registration& registration);     // 0x7150
// 0xFF0002; nothing when the contexts cannot be serialised.
std::optional<Bytes> pdpContextRecord(const std::vector<PdpContext>& contexts, const PlistSerialiser& plists);

}  // namespace kelvasi::sim::gsm
