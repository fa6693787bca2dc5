// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Link/LinkWatch.h"

#include <algorithm>
#include <array>

#include "Cockpit/Events/Coverage.h"
#include "Cockpit/Words/Age.h"
#include "Telvon/TechnologyName.h"

namespace kelvasi::cockpit {

namespace {

struct TechnologyWord {
  std::string_view name;
  std::string_view word;
};
constexpr std::array technologyWords{
    TechnologyWord{"Orvane_GSM", "GSM"}, TechnologyWord{"Orvane_CDMA", "CDMA"},
    TechnologyWord{"Orvane_LTE", "LTE"}, TechnologyWord{"Orvane_UTRAN2", "UTRAN"}};

std::string tenthsText(std::chrono::nanoseconds age) {
  return numberText(std::chrono::duration<double>(age).count(), 1) + " s";
}

}  // namespace

std::string_view nameOf(LinkState state) {
  constexpr std::array<std::string_view, 8> names{"nothing yet",      "live", "late", "silent", "lost",
                                                  "other technology", "held", "file"};
  return names[static_cast<std::size_t>(state)];
}

std::string technologyWord(std::string_view technology) {
  const auto name = shortTechnologyName(technology);
  const auto found = std::ranges::find(technologyWords, name, &TechnologyWord::name);
  return std::string(found == technologyWords.end() ? name : found->word);
}

// Another generator counts from nothing.
void LinkWatch::take(Arrival time, const Intake& intake) {
  if (intake.messages() < messages_) {
    earlierMessages_ += messages_;
    earlierShown_ += shown_;
  }
  messages_ = intake.messages();
  shown_ = intake.messages(Outcome::shown);
  lastMessage_ = time;
}

LinkState LinkWatch::stateAt(Arrival now) const {
  if (report_.source == LinkReport::Source::held) return LinkState::held;
  if (report_.source == LinkReport::Source::file) return LinkState::file;
  if (!report_.panes.empty()) return LinkState::otherTechnology;
  if (!report_.isConnected) return LinkState::lost;
  if (!lastMessage_) return LinkState::nothingYet;
  const auto age = timeSince(*lastMessage_, now);
  if (age <= liveAge) return LinkState::live;
  return age < silence ? LinkState::late : LinkState::silent;
}

Link LinkWatch::at(Arrival now, const TextStyle& style) const {
  Link link;
  link.state = stateAt(now);
  link.technology = technologyWord(report_.technology);
  link.lastMessage = lastMessage_;
  if (lastMessage_) link.age = timeSince(*lastMessage_, now);
  link.messages = earlierMessages_ + messages_;
  link.notShown = link.messages - earlierShown_ - shown_;
  link.counters = countersText(link.messages, link.notShown);
  addWords(link, now, style);
  return link;
}

void LinkWatch::addWords(Link& link, Arrival now, const TextStyle& style) const {
  const std::string age = link.age ? durationText(*link.age) : std::string();
  const std::string because = report_.reason.empty() ? "" : ": " + report_.reason;
  const std::string moment = clockText(now, style);
  switch (link.state) {
    case LinkState::nothingYet:
      link.words = "nothing received yet";
      link.shortly = "nothing yet";
      link.sentence = "Nothing received yet" + because + ".";
      return;
    case LinkState::live:
      link.words = "live " + tenthsText(*link.age);
      link.shortly = "live";
      link.sentence = "The last message came " + tenthsText(*link.age) + " ago.";
      return;
    case LinkState::late:
      link.words = age;
      link.shortly = age;
      link.sentence = "The last message came " + age + " ago.";
      return;
    case LinkState::silent:
      link.words = "no data for " + age;
      link.shortly = age;
      link.sentence = "No data for " + age + because + ".";
      return;
    case LinkState::lost:
      link.words = link.age ? "no data for " + age : "not connected";
      link.shortly = link.age ? age : "not connected";
      link.sentence = (link.age ? "No data for " + age : std::string("Nothing received yet")) +
                      (because.empty() ? ": there is no connection to the daemon" : because) + ".";
      return;
    case LinkState::otherTechnology: {
      const std::string panes = technologyWord(report_.panes);
      link.words = "daemon now " + link.technology + ", panes are " + panes + "'s";
      link.shortly = "now " + link.technology;
      link.sentence =
          "The daemon now speaks " + link.technology + "; the panes show what came of " + panes + ".";
      return;
    }
    case LinkState::held:
      link.words = "held at " + moment;
      link.shortly = "held";
      link.sentence = "The display is held at " + moment + "; messages still come in.";
      return;
    case LinkState::file:
      link.words = "recorded " + moment;
      link.shortly = "recorded";
      link.sentence = "A recorded drive, at " + moment + ".";
      return;
  }
}

}  // namespace kelvasi::cockpit
