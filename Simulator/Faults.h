// SPDX-License-Identifier: Apache-2.0
// The faults that a simulated daemon shows on request. To add one: a row in Faults.cpp, and the place where
// it shows.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace kelvasi::sim {

enum class Fault {
  noAnswer,
  answerWithoutKey,
  answerGarbage,
  unknownTechnology,
  noChannel,
  errorPair,
  nullPort,
  emptyPort,
  deadPort,
  death,
  stall,
  prefix,
  invalidType,
  otherId,
  shortRecords,
};

struct FaultKind {
  enum class Value { none, optional, required };

  Fault fault{};
  std::string_view name;
  Value value = Value::none;
  std::string_view valueName = {};
  double usualValue = 0;  // of an optional value
  double smallest = 0;
  std::string_view help;
};

// All of them, in the order in which help lists them.
std::span<const FaultKind> faultKinds();

class Faults {
 public:
  // Takes one request, "name" or "name=VALUE". The result is what is wrong with it, empty when nothing is.
  std::string add(std::string_view request);

  bool has(Fault fault) const { return value(fault).has_value(); }
  // The requested value, 0 for a fault that has none; nothing when the fault was not requested.
  std::optional<double> value(Fault fault) const;

 private:
  struct Requested {
    Fault fault;
    double value;
  };
  std::vector<Requested> requested_;
};

}  // namespace kelvasi::sim
