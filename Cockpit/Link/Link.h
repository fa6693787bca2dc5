// SPDX-License-Identifier: Apache-2.0
// Whether what is seen is true now: the age of the last message, in words.
#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Cockpit/Words/TextStyle.h"
#include "LogGenerator/Arrival.h"

namespace kelvasi::cockpit {

enum class LinkState : std::uint8_t {
  nothingYet,       // connected or not, no message has ever come
  live,             // the last message is at most 3 s old
  late,             // up to 15 s old
  silent,           // older
  lost,             // no connection
  otherTechnology,  // the daemon speaks another technology than the panes show
  held,             // the front end shows a moment that it holds still
  file,             // a moment of a recorded drive
};
std::string_view nameOf(LinkState state);  // "nothing yet", "live" and so on

// What a front end knows of the connection; it says so whenever that changes.
struct LinkReport {
  enum class Source : std::uint8_t { daemon, held, file };

  Source source = Source::daemon;
  bool isConnected = true;
  std::string reason = {};      // why not, or nothing known: "the daemon has not answered"
  std::string technology = {};  // what the daemon speaks: "Orvane_LTE" or the whole constant's name
  std::string panes = {};       // the technology that the panes still show, where that is another one
};

struct Link {
  LinkState state = LinkState::nothingYet;
  std::string words;       // "live 0.8 s", "6 s", "no data for 41 s", "daemon now GSM, panes are LTE's"
  std::string shortly;     // where room is scarce: "live", "6 s", "41 s", "3 min"
  std::string sentence;    // what it means: "No data for 41 s: the daemon has not answered."
  std::string technology;  // for people: "LTE"
  std::optional<std::chrono::nanoseconds> age;
  std::optional<Arrival> lastMessage;
  std::uint64_t messages = 0;
  std::uint64_t notShown = 0;
  std::string counters;  // "12,345 messages, 2 % not shown"
};

// "GSM", "UTRAN", "LTE", "CDMA", "IFX" for the identifiers of technologies, short or long.
std::string technologyWord(std::string_view technology);

}  // namespace kelvasi::cockpit
