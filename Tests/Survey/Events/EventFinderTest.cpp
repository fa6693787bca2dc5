// SPDX-License-Identifier: Apache-2.0
#include "Survey/Events/EventFinder.h"

#include <gtest/gtest.h>

#include "Tests/Survey/TypedReadings.h"

namespace kelvasi::survey {
namespace {

using namespace test;

constexpr std::array<std::string_view, 4> updates{"UPDATED", "NOT_UPDATED", "ROAMING_NOT_ALLOWED",
                                                  "LOCATION_AREA_NOT_ALLOWED"};
constexpr std::array<std::string_view, 5> services{"NO_SERVICE", "CS_ONLY", "PS_ONLY", "CS_PS_SERVICE",
                                                   "LIMITED_SERVICE"};
constexpr std::array<std::string_view, 3> modes{"Disconnected", "Connecting", "CELL_FACH"};
constexpr CellIdentity here{RadioFamily::umts, 10700, 48};

struct Finder {
  void take(const Readings& readings) {
    finder.arrive(readings.arrival());
    finder.take(readings);
  }

  std::vector<std::string> found;  // seconds and words
  EventFinder finder{[this](const Event& event) {
    const auto second = std::chrono::duration_cast<std::chrono::seconds>(event.time - noon).count();
    found.push_back(std::to_string(second) + " " + std::string(nameOf(event.kind)) + ": " + event.text());
  }};
};

using Found = std::vector<std::string>;

TEST(EventFinder, AStateThatChanges) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::rrcState, 0, modes));
  finder.take(Message(1s).plain(quantity::rrcState, 0, modes));
  finder.take(Message(2s).plain(quantity::rrcState, 2, modes));
  finder.take(Message(3s).plain(quantity::rrcState, 7, modes));
  EXPECT_EQ(finder.found, (Found{"2 state_change: RRC Disconnected to CELL_FACH",
                                 "3 state_change: RRC CELL_FACH to Unknown"}));
}

TEST(EventFinder, TwoRowsOfOneStateAreOneEvent) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::mmState, 19).plain(quantity::mmState, 19));
  finder.take(Message(1s).plain(quantity::mmState, 3).plain(quantity::mmState, 3));
  EXPECT_EQ(finder.found, Found{"1 state_change: MM 19 to 3"});
}

TEST(EventFinder, OtherNumbersAreNoEvents) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::ciphering, 0).plain(quantity::rssi, -80));
  finder.take(Message(1s).plain(quantity::ciphering, 1).plain(quantity::rssi, -90));
  EXPECT_EQ(finder.found, Found{});
}

TEST(EventFinder, ARejectHasItsCause) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::mmUpdateStatus, 0, updates));
  finder.take(Message(1s).plain(quantity::mmUpdateStatus, 1, updates));  // failed, not refused
  finder.take(Message(2s).plain(quantity::mmUpdateStatus, 3, updates));
  finder.take(Message(3s).plain(quantity::mmUpdateStatus, 3, updates));
  finder.take(Message(4s).plain(quantity::mmUpdateStatus, 0, updates));
  finder.take(Message(5s).plain(quantity::gmmUpdateStatus, 2, updates));
  EXPECT_EQ(finder.found, (Found{"2 reject: location update rejected: LOCATION_AREA_NOT_ALLOWED",
                                 "5 reject: GPRS update rejected: ROAMING_NOT_ALLOWED"}));
}

TEST(EventFinder, ServiceByTheRecordThatSaysIt) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::serviceType, 3, services));
  finder.take(Message(1s).plain(quantity::serviceType, 1, services));
  finder.take(Message(2s).plain(quantity::serviceType, 4, services));
  finder.take(Message(3s).plain(quantity::serviceType, 0, services));
  finder.take(Message(4s).plain(quantity::serviceType, 3, services));
  EXPECT_EQ(finder.found, (Found{"2 service_lost: service lost: LIMITED_SERVICE",
                                 "4 service_back: service back: CS_PS_SERVICE"}));
}

TEST(EventFinder, NoServiceFromTheStartIsAnEvent) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::serviceType, 0, services));
  EXPECT_EQ(finder.found, Found{"0 service_lost: service lost: NO_SERVICE"});
}

TEST(EventFinder, ServiceByTheServingCellWhereNoRecordSaysIt) {
  Finder finder;
  finder.finder.hearServing(here, noon);
  for (int second = 1; second < 30; second += 2) finder.take(Message(second * 1s));
  finder.take(Message(30s));
  finder.finder.hearServing(here, noon + 30s);
  EXPECT_EQ(finder.found, (Found{"15 service_lost: service lost: no serving cell for 15 s",
                                 "30 service_back: service back: umts:10700/48"}));
}

TEST(EventFinder, WhereARecordSaysTheServiceASilentCellSaysNothing) {
  Finder finder;
  finder.take(Message(0s).plain(quantity::serviceType, 3, services));
  finder.finder.hearServing(here, noon);
  for (int second = 1; second < 60; second += 2) finder.take(Message(second * 1s));
  EXPECT_EQ(finder.found, Found{});
}

TEST(EventFinder, ASilentLinkIsLostAndComesBack) {
  Finder finder;
  finder.take(Message(0s));
  finder.take(Message(15s));
  finder.take(Message(46s));
  EXPECT_EQ(finder.found,
            (Found{"30 link_lost: link lost: no message for 15 s", "46 link_back: link back: after 31 s"}));
}

TEST(EventFinder, ASilentLinkIsSeenWithoutAMessage) {
  Finder finder;
  finder.take(Message(0s));
  finder.finder.pass(noon + 15s);
  EXPECT_EQ(finder.found, Found{});
  finder.finder.pass(noon + 16s);
  finder.finder.pass(noon + 99s);
  EXPECT_EQ(finder.found, Found{"15 link_lost: link lost: no message for 15 s"});
}

TEST(EventFinder, ALostLinkIsNoLostService) {
  Finder finder;
  finder.take(Message(0s));
  finder.finder.hearServing(here, noon);
  finder.take(Message(100s));
  finder.finder.hearServing(here, noon + 100s);
  EXPECT_EQ(finder.found,
            (Found{"15 link_lost: link lost: no message for 15 s", "100 link_back: link back: after 100 s"}));
}

TEST(EventFinder, AConnectionThatWent) {
  Finder finder;
  finder.take(Message(0s));
  finder.finder.lose(noon + 2s, "the daemon closed the channel");
  finder.finder.pass(noon + 60s);
  finder.take(Message(62s));
  EXPECT_EQ(finder.found, (Found{"2 link_lost: link lost: the daemon closed the channel",
                                 "62 link_back: link back: after 62 s"}));
}

TEST(EventFinder, AChangeOfCellAndOfRat) {
  Finder finder;
  SeenCell umts;
  umts.identity = here;
  SeenCell gsm;
  gsm.identity = {RadioFamily::gsm, 62, 12};
  SeenCell other;
  other.identity = {RadioFamily::gsm, 66, 13};
  finder.finder.serve(nullptr, umts, noon);
  finder.finder.serve(&umts, gsm, noon + 1s);
  finder.finder.serve(&gsm, other, noon + 2s);
  EXPECT_EQ(finder.found, (Found{"1 cell_change: cell change umts:10700/48 to gsm:62/12",
                                 "1 rat_change: RAT change umts to gsm",
                                 "2 cell_change: cell change gsm:62/12 to gsm:66/13"}));
}

// 1x and EV-DO serve side by side.
TEST(EventFinder, AStateOfAnAirInterfaceStandsBesideItsCell) {
  std::vector<std::string> found;
  EventFinder finder([&](const Event& event) { found.push_back(event.text() + ", " + textOf(event.cell)); });
  finder.hearServing({RadioFamily::evdo, 242, 344}, noon);
  finder.take(Message(0s).plain(quantity::evdoState, 0).plain(quantity::oneXState, 6));
  finder.take(Message(1s).plain(quantity::oneXState, 7));
  finder.hearServing({RadioFamily::cdma, 283, 284}, noon + 2s);
  finder.take(Message(2s).plain(quantity::evdoState, 5).plain(quantity::oneXState, 6));
  EXPECT_EQ(found, (Found{"1x 6 to 7, ", "EV-DO 0 to 5, evdo:242/344", "1x 7 to 6, cdma:283/284"}));
}

TEST(EventFinder, WhatIsNoChangeHasAReasonAndNoFromAndTo) {
  std::vector<Event> found;
  EventFinder finder([&](const Event& event) { found.push_back(event); });
  finder.take(Message(0s).plain(quantity::serviceType, 0, services));
  finder.take(Message(0s).plain(quantity::mmUpdateStatus, 2, updates));
  finder.lose(noon, "gone");
  Intake intake;
  intake.count(0xB193, Outcome::notAskedFor, noon, std::vector<std::uint8_t>(20));
  finder.take(intake);
  ASSERT_EQ(found.size(), 4u);
  const std::array<std::string_view, 4> reasons{"NO_SERVICE", "ROAMING_NOT_ALLOWED", "gone",
                                                "not asked for, 20 bytes"};
  for (std::size_t at = 0; at < found.size(); ++at) {
    EXPECT_EQ(found[at].reason, reasons[at]);
    EXPECT_EQ(found[at].from, "");
    EXPECT_EQ(found[at].to, at == 3 ? "0xB193" : "");
  }
}

TEST(EventFinder, AnUnknownRecordIsNewsOnce) {
  Finder finder;
  Intake intake;
  const std::vector<std::uint8_t> record(64);
  intake.count(0xB0C2, Outcome::shown, noon, record);
  intake.count(0xB193, Outcome::notAskedFor, noon + 1s, record);
  intake.count(0xB179, Outcome::tooShort, noon + 1s, record);
  finder.finder.take(intake);
  intake.count(0xB193, Outcome::notAskedFor, noon + 2s, record);
  finder.finder.take(intake);
  intake.count(0xFF0005, Outcome::notAskedFor, noon + 3s, record);
  finder.finder.take(intake);
  EXPECT_EQ(finder.found,
            (Found{"1 unknown_record: unknown record 0xB193 first seen: not asked for, 64 bytes",
                   "3 unknown_record: unknown record 0xFF0005 first seen: not asked for, 64 bytes"}));
}

}  // namespace
}  // namespace kelvasi::survey
