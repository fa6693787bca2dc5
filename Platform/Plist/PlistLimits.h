// SPDX-License-Identifier: Apache-2.0
// How much of a property list from outside is accepted.
#pragma once

#include <cstddef>

namespace kelvasi::plistLimits {

constexpr std::size_t documentBytes = std::size_t{16} << 20;
constexpr int levels = 128;                       // dictionaries and arrays inside one another
constexpr std::size_t values = 1'000'000;         // keys and values, each as often as it is referred to
constexpr std::size_t dictionaryEntries = 16384;  // the library that writes them slows down beyond
// Bytes of all strings and data of a binary document, each as often as it is referred to.
constexpr std::size_t contentBytes = std::size_t{64} << 20;

// What is written is our own and may be larger; these keep the library's 32-bit lengths from overflowing.
constexpr std::size_t writtenValues = 4'000'000;
constexpr std::size_t writtenContentBytes = std::size_t{256} << 20;

}  // namespace kelvasi::plistLimits
