// SPDX-License-Identifier: Apache-2.0
// What an application and the daemon's server tell each other in their frames.
#pragma once

#include <optional>
#include <span>
#include <string_view>

#include "Platform/TelephonyDaemon.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// The server's name in the runtime directory.
inline constexpr std::string_view daemonServerName = "telvon";
inline constexpr std::size_t maximumPortName = 255;
inline constexpr std::size_t maximumNotification = 4096;

Bytes encodeAnswer(const LogChannelAnswer& answer);
// Nothing when the data are not an answer.
std::optional<LogChannelAnswer> decodeAnswer(std::span<const std::uint8_t> data);

// The same bytes; they last as long as what they are taken from.
std::span<const std::uint8_t> bytesOf(std::string_view text);
std::string_view textOf(std::span<const std::uint8_t> bytes);

}  // namespace kelvasi
