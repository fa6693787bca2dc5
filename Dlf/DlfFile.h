// SPDX-License-Identifier: Apache-2.0
// A DLF file: the version report, then the raw messages of the history's intervals.
#pragma once

#include <optional>
#include <span>

#include "Platform/Platform.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// Writes the version report to the beginning of `header`. False, with a line in the system log, where it
// finds no room.
bool writeDlfHeader(const Platform& platform, std::span<std::uint8_t> header);

// A file that holds the version report only. Nothing, with a line in the system log, when the report failed.
std::optional<Bytes> beginDlf(const Platform& platform);

// Appends an interval's raw messages without their first byte, the log type of the first of them.
void appendDlfInterval(Bytes& dlf, std::span<const std::uint8_t> rawMessages);

}  // namespace kelvasi
