// SPDX-License-Identifier: Apache-2.0
// The mobility-management records, from the registration that they report.
#pragma once

#include "Plist/PlistValue.h"
#include "Simulator/Handset/Registration.h"

namespace kelvasi::sim::gsm {

Bytes gmmStateRecord(const Registration& registration);           // 0x7130
Bytes mmStateRecord(const Registration& registration);            // 0x7131
Bytes registrationStateRecord(const Registration& registration);  // 0x7132
Bytes registeredPlmnRecord(const Registration& registration);     // 0x7135
Bytes equivalentPlmnRecord(const Registration& registration);     // 0x7150

}  // namespace kelvasi::sim::gsm
