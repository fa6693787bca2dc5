// A DLF file: the version report, then the raw messages of the history's intervals.
#pragma once

#include <optional>
#include <span>

#include "Platform/Platform.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// A file that holds the version report only. Nothing, with a line in the system log, when the report failed.
std::optional<Bytes> beginDlf(const Platform& platform);

// Appends an interval's raw messages without their first byte, the log type of the first of them.
void appendDlfInterval(Bytes& dlf, std::span<const std::uint8_t> rawMessages);

}  // namespace kelvasi
