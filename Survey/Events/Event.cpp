// SPDX-License-Identifier: Apache-2.0
#include "Survey/Events/Event.h"

#include <algorithm>
#include <array>

namespace kelvasi::survey {

namespace {

// The field's words for the quantities whose states are events.
struct StateWords {
  const Quantity* quantity;
  std::string_view words;
};
constexpr std::array stateWords{
    StateWords{&quantity::mmState, "MM"},
    StateWords{&quantity::mmSubState, "MM substate"},
    StateWords{&quantity::gmmState, "GMM"},
    StateWords{&quantity::gmmSubState, "GMM substate"},
    StateWords{&quantity::mmUpdateStatus, "location update"},
    StateWords{&quantity::gmmUpdateStatus, "GPRS update"},
    StateWords{&quantity::registrationState, "registration"},
    StateWords{&quantity::rrState, "RR"},
    StateWords{&quantity::rrcState, "RRC"},
    StateWords{&quantity::oneXState, "1x"},
    StateWords{&quantity::evdoState, "EV-DO"},
    StateWords{&quantity::evdoSession, "EV-DO session"},
};

std::string wordsOf(const Quantity* quantity) {
  const auto found = std::ranges::find(stateWords, quantity, &StateWords::quantity);
  if (found != stateWords.end()) return std::string(found->words);
  return quantity ? std::string(quantity->id) : std::string();
}

std::string beginningOf(const Event& event) {
  switch (event.kind) {
    case EventKind::cellChange:
      return "cell change ";
    case EventKind::ratChange:
      return "RAT change ";
    case EventKind::stateChange:
      return wordsOf(event.quantity) + " ";
    case EventKind::reject:
      return wordsOf(event.quantity) + " rejected: ";
    case EventKind::serviceLost:
      return "service lost: ";
    case EventKind::serviceBack:
      return "service back: ";
    case EventKind::linkLost:
      return "link lost: ";
    case EventKind::linkBack:
      return "link back: ";
    case EventKind::unknownRecord:
      return "unknown record ";
  }
  return {};
}

}  // namespace

std::string Event::text() const {
  const std::string beginning = beginningOf(*this);
  if (kind == EventKind::unknownRecord) return beginning + to + " first seen: " + reason;
  if (from.empty() && to.empty()) return beginning + reason;
  return beginning + from + " to " + to;
}

}  // namespace kelvasi::survey
