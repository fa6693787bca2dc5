// SPDX-License-Identifier: Apache-2.0
// Data and dates as plain text, for documents that have no kind of their own for them.
#pragma once

#include <string>

#include "Plist/PlistValue.h"

namespace kelvasi {

// RFC 4648, 4.
std::string base64(const Bytes& bytes);

// "2024-03-05T14:07:09Z", the fraction of a second dropped, kept within the years 1 to 9999.
std::string iso8601(PlistDate date);

}  // namespace kelvasi
