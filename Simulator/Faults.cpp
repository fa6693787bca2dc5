// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Faults.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace kelvasi::sim {

namespace {

using enum FaultKind::Value;

constexpr std::array kinds{
    FaultKind{
        .fault = Fault::noAnswer, .name = "no-answer", .help = "GetTechnology gets a reply without data"},
    FaultKind{.fault = Fault::answerWithoutKey,
              .name = "answer-without-key",
              .help = "the answer to GetTechnology lacks its key"},
    FaultKind{.fault = Fault::answerGarbage,
              .name = "answer-garbage",
              .help = "the answer to GetTechnology is no property list"},
    FaultKind{.fault = Fault::unknownTechnology,
              .name = "unknown-technology",
              .help = "the answer to GetTechnology names a technology that does not exist"},
    FaultKind{.fault = Fault::noChannel,
              .name = "no-channel",
              .help = "a request for a log channel is not answered"},
    FaultKind{.fault = Fault::errorPair,
              .name = "error-pair",
              .value = required,
              .valueName = "CODE",
              .smallest = -2147483648.0,
              .help = "a request for a log channel is refused with this error code"},
    FaultKind{.fault = Fault::nullPort, .name = "null-port", .help = "a log channel has no port name"},
    FaultKind{.fault = Fault::emptyPort, .name = "empty-port", .help = "a log channel's port name is empty"},
    FaultKind{.fault = Fault::deadPort,
              .name = "dead-port",
              .help = "nobody listens under a log channel's port name"},
    FaultKind{.fault = Fault::death,
              .name = "death",
              .value = required,
              .valueName = "SECONDS",
              .help = "the daemon dies that long after its start, without a goodbye"},
    FaultKind{.fault = Fault::stall,
              .name = "stall",
              .value = required,
              .valueName = "SECONDS",
              .help = "the daemon stops itself that long after its start, until it gets SIGCONT"},
    FaultKind{.fault = Fault::prefix,
              .name = "prefix",
              .value = optional,
              .valueName = "N",
              .usualValue = 3,
              .smallest = 1,
              .help = "every n-th message has a two-byte prefix that begins with 0x81"},
    FaultKind{.fault = Fault::invalidType,
              .name = "invalid-type",
              .value = optional,
              .valueName = "N",
              .usualValue = 10,
              .smallest = 1,
              .help = "after every n-th message comes a copy with an invalid log type"},
    FaultKind{.fault = Fault::otherId,
              .name = "other-id",
              .value = optional,
              .valueName = "N",
              .usualValue = 10,
              .smallest = 1,
              .help = "after every n-th message comes a damaged copy under another message id"},
    FaultKind{.fault = Fault::shortRecords,
              .name = "short",
              .value = optional,
              .valueName = "N",
              .usualValue = 5,
              .smallest = 1,
              .help = "every n-th message is cut short, unless it carries a property list"},
};

std::optional<double> number(std::string_view text) {
  double value = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
  if (error != std::errc() || end != text.data() + text.size() || !std::isfinite(value)) return std::nullopt;
  return value;
}

std::string usage(const FaultKind& kind) {
  return std::string(kind.name) + "=" + std::string(kind.valueName);
}

}  // namespace

std::span<const FaultKind> faultKinds() {
  return kinds;
}

std::string Faults::add(std::string_view request) {
  const std::size_t sign = request.find('=');
  const std::string_view name = request.substr(0, sign);
  const auto kind = std::ranges::find(kinds, name, &FaultKind::name);
  if (kind == kinds.end()) return "there is no fault \"" + std::string(name) + "\"";
  if (sign == std::string_view::npos) {
    if (kind->value == required) return std::string(name) + " needs a value: " + usage(*kind);
    requested_.push_back({kind->fault, kind->usualValue});
    return {};
  }
  if (kind->value == none) return std::string(name) + " takes no value";
  const auto value = number(request.substr(sign + 1));
  if (!value || *value < kind->smallest || *value > 2147483647.0)
    return "\"" + std::string(request.substr(sign + 1)) + "\" is no value for " + usage(*kind);
  requested_.push_back({kind->fault, *value});
  return {};
}

std::optional<double> Faults::value(Fault fault) const {
  const auto last = std::find_if(requested_.rbegin(), requested_.rend(),
                                 [fault](const Requested& entry) { return entry.fault == fault; });
  return last == requested_.rend() ? std::nullopt : std::optional(last->value);
}

}  // namespace kelvasi::sim
