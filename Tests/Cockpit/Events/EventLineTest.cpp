// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/EventLine.h"

#include <gtest/gtest.h>

#include "Cockpit/Events/AlarmBook.h"
#include "Cockpit/Events/Marks.h"
#include "Cockpit/Serving/CellWords.h"

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;
using survey::Event;
using survey::EventKind;

std::string words(EventKind kind, std::string from, std::string to, const Quantity* quantity = nullptr) {
  return wordsOf({.kind = kind, .quantity = quantity, .from = std::move(from), .to = std::move(to)});
}

std::string because(EventKind kind, std::string reason, const Quantity* quantity = nullptr) {
  return wordsOf({.kind = kind, .quantity = quantity, .reason = std::move(reason)});
}

TEST(EventWords, ACellChangeSaysNoMoreThanItHasTo) {
  EXPECT_EQ(words(EventKind::cellChange, "lte:3350/404", "lte:3350/362"), "cell change PCI 404 to 362");
  EXPECT_EQ(words(EventKind::cellChange, "gsm:62/17", "gsm:64/17"), "cell change 62/17 to 64/17");
  EXPECT_EQ(words(EventKind::cellChange, "utra-tdd:10063/24", "utra-tdd:10063/29"),
            "cell change CPI 24 to 29");
  EXPECT_EQ(words(EventKind::cellChange, "cdma:283/344", "cdma:283/4"), "cell change PN 344 to 4");
  EXPECT_EQ(words(EventKind::cellChange, "umts:10588/80", "gsm:62/17"),
            "cell change UMTS 10588/80 to GSM 62/17");
}

TEST(EventWords, APartOfAnIdentityIsSaidAsItIs) {
  EXPECT_EQ(words(EventKind::cellChange, "gsm:62/17", "gsm:62"), "cell change 62/17 to 62");
  EXPECT_EQ(words(EventKind::cellChange, "umts:?/80", "umts:10588/81"), "cell change ?/80 to 10588/81");
  EXPECT_EQ(words(EventKind::cellChange, "here", "there"), "cell change here to there");
}

TEST(EventWords, OfEveryKind) {
  EXPECT_EQ(words(EventKind::ratChange, "umts", "lte"), "RAT change UMTS to LTE");
  EXPECT_EQ(words(EventKind::ratChange, "evdo", "cdma"), "RAT change EV-DO to 1x");
  EXPECT_EQ(words(EventKind::stateChange, "Idle", "Connected", &quantity::rrcState), "RRC Idle to Connected");
  EXPECT_EQ(because(EventKind::reject, "GU3", &quantity::gmmUpdateStatus), "GPRS update rejected: GU3");
  EXPECT_EQ(because(EventKind::serviceLost, "no serving cell for 15 s"),
            "service lost: no serving cell for 15 s");
  EXPECT_EQ(because(EventKind::serviceBack, "lte:3350/404"), "service back: LTE 3350/404");
  EXPECT_EQ(because(EventKind::serviceBack, "Full service"), "service back: Full service");
  EXPECT_EQ(because(EventKind::linkLost, "no message for 15 s"), "link lost: no message for 15 s");
  EXPECT_EQ(because(EventKind::linkBack, "after 41 s"), "link back: after 41 s");
  EXPECT_EQ(wordsOf({.kind = EventKind::unknownRecord, .to = "0xB17E", .reason = "not asked for, 12 bytes"}),
            "unknown record 0xB17E first seen: not asked for, 12 bytes");
}

TEST(CellWords, EveryTechnologyHasItsOwn) {
  EXPECT_EQ(cellName({RadioFamily::lte, 3350, 404}), "PCI 404");
  EXPECT_EQ(cellName({RadioFamily::umts, 10588, 80}), "PSC 80");
  EXPECT_EQ(cellName({RadioFamily::gsm, 84, CellIdentity::unknown}), "ARFCN 84");
  EXPECT_EQ(cellName({RadioFamily::gsm, 84, 18}), "BSIC 18");
  EXPECT_EQ(cellName({}), "");
  EXPECT_EQ(fullCellName({RadioFamily::evdo, 242, 344}), "EV-DO 242/344");
  EXPECT_EQ(fullCellName({RadioFamily::utraTdd, 10079, 64}), "UTRA TDD 10079/64");
}

TEST(CellWords, ACellIsReadBackOrNotAtAll) {
  for (const CellIdentity cell :
       {CellIdentity{RadioFamily::lte, 3350, 404}, CellIdentity{RadioFamily::gsm, 62},
        CellIdentity{RadioFamily::utraTdd, CellIdentity::unknown, 5}})
    EXPECT_EQ(cellFromText(textOf(cell)), cell);
  for (const char* text :
       {"", ":", "lte", "lte:", "lte:x", "lte:3350/", "lte:3350/404 ", "nr:1/2", "none:1/2"})
    EXPECT_EQ(cellFromText(text), std::nullopt) << text;
}

TEST(CellWords, CarriersAreNamedWhereTheyAreFew) {
  EXPECT_EQ(carrierWords({RadioFamily::lte, 3350, 404}).bands, "B7");
  EXPECT_EQ(carrierWords({RadioFamily::lte, 3350, 404}).frequency, "2680 MHz");
  EXPECT_EQ(carrierWords({RadioFamily::gsm, 600, 1}).bands, "DCS 1800 or PCS 1900");
  EXPECT_EQ(carrierWords({RadioFamily::cdma, 283, 4}).bands, "");
  EXPECT_EQ(carrierWords({RadioFamily::cdma, 283, 4}, 0).bands, "BC0");
  EXPECT_EQ(carrierWords({RadioFamily::cdma, 283, 4}, 0).frequency, "878.49 MHz");
}

survey::AlarmRule ruleOf(const char* text) {
  return std::get<survey::AlarmRule>(survey::parseAlarmRule(text));
}

TEST(AlarmWords, OfEveryKindOfRule) {
  const CellIdentity cell{RadioFamily::lte, 3350, 404};
  const auto band = ruleOf("rsrp < -115 for 10s");
  const auto absent = ruleOf("rsrp absent for 30s");
  const auto event = ruleOf("event reject");
  const auto words = [&](const survey::AlarmRule& rule, std::optional<double> value,
                         const char* happened = "") {
    return wordsOf({.rule = rule, .time = 40s, .since = 10s, .value = value, .cell = cell, .event = happened},
                   {});
  };
  EXPECT_EQ(words(band, -117.25), "RSRP -117.25 dBm, LTE 3350/404");
  EXPECT_EQ(words(absent, {}), "no RSRP for 30 s, LTE 3350/404");
  EXPECT_EQ(words(event, {}, "GPRS update rejected: GU3"), "GPRS update rejected: GU3");
}

TEST(Marks, AreNumberedAndNotedLater) {
  Marks marks;
  const auto first = marks.set(10s, "", {});
  const auto second = marks.set(20s, "bridge", {});
  EXPECT_TRUE(marks.note(first, "tunnel"));
  EXPECT_FALSE(marks.note(second + 1, "x"));
  ASSERT_EQ(marks.all().size(), 2U);
  EXPECT_EQ(marks.all()[0].note, "tunnel");
  EXPECT_EQ(marks.all()[0].timeText, "00:00:10");
  EXPECT_EQ(marks.newestFirst(1).at(0).note, "bridge");
  EXPECT_EQ(marks.newestFirst(9).size(), 2U);
}

TEST(Marks, TheOldestMakeWay) {
  Marks marks;
  for (std::size_t mark = 0; mark < Marks::mostMarks + 2; ++mark) marks.set(0s, "", {});
  EXPECT_EQ(marks.all().size(), Marks::mostMarks);
  EXPECT_EQ(marks.all().front().number, 3U);
}

}  // namespace
}  // namespace kelvasi::cockpit
