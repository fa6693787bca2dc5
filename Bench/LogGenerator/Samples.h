// SPDX-License-Identifier: Apache-2.0
// The records that the benchmarks decode kind by kind. To add one, add a line to the table of its technology.
#pragma once

#include <array>
#include <cstdint>
#include <limits>
#include <span>
#include <string_view>
#include <vector>

#include "Bench/Support/Random.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"
#include "Plist/PlistValue.h"

namespace kelvasi::bench {

using Messages = std::vector<Bytes>;

struct SampleList {
  EntryList entries;
  std::size_t size = 0;
};

struct FieldValue {
  std::string_view name;
  std::int64_t value = 0;
};

struct Sample {
  std::string_view name;
  LogCode logCode = 0;
  std::size_t length = 0;  // at least
  std::span<const Field> layout = {};
  // Fields hold any value that fits and is below this; it keeps states to those that have a name.
  std::uint64_t below = std::numeric_limits<std::uint64_t>::max();
  std::array<SampleList, 2> lists = {};
  std::array<FieldValue, 2> fixed = {};  // the same in every record
  // Of a record that is not fields and lists alone: all of it.
  Bytes (*record)(Random& random) = nullptr;
  // Of a record of the telephony daemon itself: its property list.
  PlistValue (*payload)(Random& random) = nullptr;
};

struct Technology {
  std::string_view name;
  std::string_view id;
  std::span<const Sample> samples;
};

std::span<const Technology> technologies();

// A record with values of its own at every call.
Bytes makeRecord(const Sample& sample, Random& random);
// Some records of one kind.
Messages recordsOf(const Sample& sample);

}  // namespace kelvasi::bench
