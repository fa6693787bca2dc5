// SPDX-License-Identifier: Apache-2.0
// The names that are built in, each table in the order of its numbers. The build writes them.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "Radio/NetworkId.h"

namespace kelvasi {

struct NetworkEntry {
  NetworkId network;
  std::string_view name;  // where several providers use the network and none is its owner, all: "Tigo / UNE"
};

struct CountryEntry {
  std::uint16_t mcc;
  std::string_view name;  // several where they share the code: "Israel / State of Palestine"
};

std::span<const NetworkEntry> networkTable();
std::span<const CountryEntry> countryTable();

}  // namespace kelvasi
