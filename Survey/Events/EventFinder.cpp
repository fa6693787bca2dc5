// SPDX-License-Identifier: Apache-2.0
#include "Survey/Events/EventFinder.h"

#include <algorithm>
#include <charconv>

namespace kelvasi::survey {

namespace {

enum class Meaning : std::uint8_t { state, update, service };

struct Watched {
  const Quantity* quantity;
  Meaning meaning = Meaning::state;
  RadioFamily family = RadioFamily::none;  // the air interface, where a handset may have two
};
constexpr std::array watched{
    Watched{&quantity::mmState},
    Watched{&quantity::mmSubState},
    Watched{&quantity::gmmState},
    Watched{&quantity::gmmSubState},
    Watched{&quantity::registrationState},
    Watched{&quantity::rrState},
    Watched{&quantity::rrcState},
    Watched{&quantity::oneXState, Meaning::state, RadioFamily::cdma},
    Watched{&quantity::evdoState, Meaning::state, RadioFamily::evdo},
    Watched{&quantity::evdoSession, Meaning::state, RadioFamily::evdo},
    Watched{&quantity::mmUpdateStatus, Meaning::update},
    Watched{&quantity::gmmUpdateStatus, Meaning::update},
    Watched{&quantity::serviceType, Meaning::service},
};

// U3 and GU3 of 3GPP TS 24.008, 4.1.2.2 and 4.1.3.2: the network does not allow it. Below, an update was made
// or failed for another reason.
constexpr std::int64_t firstRefusal = 2;

constexpr std::int64_t noService = 0;
constexpr std::int64_t limitedService = 4;

std::string inSeconds(std::chrono::nanoseconds time) {
  return std::to_string(std::chrono::duration_cast<std::chrono::seconds>(time).count()) + " s";
}

std::string inHex(LogCode logCode) {
  std::array<char, 16> digits;
  const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), logCode, 16).ptr;
  std::string text(digits.data(), end);
  std::ranges::transform(text, text.begin(),
                         [](char each) { return each >= 'a' ? static_cast<char>(each - 'a' + 'A') : each; });
  return "0x" + std::string(text.size() < 4 ? 4 - text.size() : 0, '0') + text;
}

bool isUnknown(Outcome outcome) {
  return outcome == Outcome::notAskedFor || outcome == Outcome::notUnderstood ||
         outcome == Outcome::unknownLogType;
}

}  // namespace

void EventFinder::pass(Arrival time) {
  if (lastMessage_ && !lostAt_ && time - *lastMessage_ > silence)
    lose(*lastMessage_ + silence, "no message for " + inSeconds(silence));
  if (saysService_ || hasService_ != true || lostAt_ || !lastServing_) return;
  if (time - *lastServing_ > silence)
    setService(false, *lastServing_ + silence, "no serving cell for " + inSeconds(silence));
}

void EventFinder::arrive(Arrival time) {
  pass(time);
  regain(time);
  lastMessage_ = time;
}

void EventFinder::take(const Readings& readings) {
  for (const Reading& reading : readings.all()) follow(reading, readings.arrival());
}

void EventFinder::follow(const Reading& reading, Arrival time) {
  const Quantity* quantity = quantityOf(reading);
  if (!quantity || quantity->kind != QuantityKind::state) return;
  const auto which = std::ranges::find(watched, quantity, &Watched::quantity);
  const auto number = numberOf(reading);
  if (which == watched.end() || !number) return;
  State& state = states_[static_cast<std::size_t>(which - watched.begin())];
  const auto raw = static_cast<std::int64_t>(*number);
  if (state.isKnown && state.raw == raw) return;
  const std::string text = textOf(reading).value_or("");
  if (which->meaning == Meaning::service) followService(raw, text, time);
  if (which->meaning == Meaning::update && raw >= firstRefusal) {
    give({.time = time, .kind = EventKind::reject, .cell = cell_, .quantity = quantity, .reason = text});
  } else if (which->meaning == Meaning::state && state.isKnown) {
    give({.time = time,
          .kind = EventKind::stateChange,
          .cell = cellOf(which->family),
          .quantity = quantity,
          .from = state.text,
          .to = text});
  }
  state = {raw, true, text};
}

void EventFinder::followService(std::int64_t raw, const std::string& text, Arrival time) {
  saysService_ = true;
  setService(raw != noService && raw != limitedService, time, text);
}

void EventFinder::setService(bool isThere, Arrival time, std::string reason) {
  const bool isNews = hasService_ ? *hasService_ != isThere : !isThere;
  hasService_ = isThere;
  if (!isNews) return;
  give({.time = time,
        .kind = isThere ? EventKind::serviceBack : EventKind::serviceLost,
        .cell = cell_,
        .reason = std::move(reason)});
}

void EventFinder::serve(const SeenCell* from, const SeenCell& to, Arrival time) {
  camp(to.identity);
  if (!from) return;
  give({.time = time,
        .kind = EventKind::cellChange,
        .cell = cell_,
        .from = textOf(from->identity),
        .to = textOf(to.identity)});
  if (from->identity.family == to.identity.family) return;
  give({.time = time,
        .kind = EventKind::ratChange,
        .cell = cell_,
        .from = std::string(nameOf(from->identity.family)),
        .to = std::string(nameOf(to.identity.family))});
}

void EventFinder::camp(const CellIdentity& cell) {
  cell_ = cell;
  if (cell.family == RadioFamily::cdma) oneXCell_ = cell;
  if (cell.family == RadioFamily::evdo) evdoCell_ = cell;
}

const CellIdentity& EventFinder::cellOf(RadioFamily airInterface) const {
  if (airInterface == RadioFamily::cdma) return oneXCell_;
  return airInterface == RadioFamily::evdo ? evdoCell_ : cell_;
}

void EventFinder::hearServing(const CellIdentity& cell, Arrival time) {
  camp(cell);
  lastServing_ = time;
  if (!saysService_) setService(true, time, textOf(cell));
}

void EventFinder::take(const Intake& intake) {
  const auto counts = intake.counts();
  for (; countsSeen_ < counts.size(); ++countsSeen_) {
    const IntakeCount& count = counts[countsSeen_];
    if (!isUnknown(count.outcome)) continue;
    give({.time = count.first,
          .kind = EventKind::unknownRecord,
          .cell = cell_,
          .to = inHex(count.logCode),
          .reason = std::string(nameOf(count.outcome)) + ", " + std::to_string(count.lastLength) + " bytes"});
  }
}

void EventFinder::lose(Arrival time, std::string reason) {
  if (lostAt_) return;
  lostAt_ = time;
  give({.time = time, .kind = EventKind::linkLost, .cell = cell_, .reason = std::move(reason)});
}

void EventFinder::regain(Arrival time) {
  if (!lostAt_) return;
  const auto away = time - lastMessage_.value_or(*lostAt_);
  lostAt_.reset();
  lastServing_.reset();  // nobody could hear of it
  give({.time = time, .kind = EventKind::linkBack, .cell = cell_, .reason = "after " + inSeconds(away)});
}

void EventFinder::give(Event event) {
  if (onEvent_) onEvent_(event);
}

}  // namespace kelvasi::survey
