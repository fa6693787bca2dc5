// SPDX-License-Identifier: Apache-2.0
// The CDMA records, in the order in which the start command names their codes.
#pragma once

#include <span>

#include "LogGenerator/C2K/C2KRecord.h"

namespace kelvasi {

std::span<const C2KRecord> c2kRecords();

}  // namespace kelvasi
