// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Link/LinkWatch.h"

#include <gtest/gtest.h>

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;

constexpr Arrival noon = std::chrono::hours(480012);

class LinkWatchTest : public testing::Test {
 protected:
  void arrive(Arrival after, Outcome outcome = Outcome::shown) {
    intake_.count(0xB0C2, outcome, noon + after, {});
    watch_.take(noon + after, intake_);
  }
  Link at(Arrival after) const { return watch_.at(noon + after, {}); }

  Intake intake_;
  LinkWatch watch_;
};

TEST_F(LinkWatchTest, NothingYet) {
  EXPECT_EQ(at(0s).state, LinkState::nothingYet);
  EXPECT_EQ(at(0s).words, "nothing received yet");
  EXPECT_EQ(at(0s).shortly, "nothing yet");
  EXPECT_EQ(at(0s).sentence, "Nothing received yet.");
  EXPECT_EQ(at(0s).counters, "0 messages");
  EXPECT_EQ(at(0s).age, std::nullopt);
}

TEST_F(LinkWatchTest, LiveTicksInTenths) {
  arrive(0s);
  EXPECT_EQ(at(800ms).state, LinkState::live);
  EXPECT_EQ(at(800ms).words, "live 0.8 s");
  EXPECT_EQ(at(800ms).shortly, "live");
  EXPECT_EQ(at(800ms).sentence, "The last message came 0.8 s ago.");
  EXPECT_EQ(at(3s).words, "live 3.0 s");
  EXPECT_EQ(at(-1s).words, "live 0.0 s");
}

TEST_F(LinkWatchTest, LateThenSilent) {
  arrive(0s);
  EXPECT_EQ(at(3001ms).state, LinkState::late);
  EXPECT_EQ(at(6s).words, "6 s");
  EXPECT_EQ(at(14999ms).state, LinkState::late);
  EXPECT_EQ(at(15s).state, LinkState::silent);
  EXPECT_EQ(at(41s).words, "no data for 41 s");
  EXPECT_EQ(at(41s).shortly, "41 s");
  EXPECT_EQ(at(41s).sentence, "No data for 41 s.");
  EXPECT_EQ(at(3min).words, "no data for 3 min");
}

TEST_F(LinkWatchTest, SaysWhyThereIsNothing) {
  watch_.hear({.isConnected = false, .reason = "the daemon has not answered"});
  EXPECT_EQ(at(0s).state, LinkState::lost);
  EXPECT_EQ(at(0s).words, "not connected");
  EXPECT_EQ(at(0s).sentence, "Nothing received yet: the daemon has not answered.");
  arrive(0s);
  EXPECT_EQ(at(41s).words, "no data for 41 s");
  EXPECT_EQ(at(41s).sentence, "No data for 41 s: the daemon has not answered.");
  watch_.hear({.isConnected = false});
  EXPECT_EQ(at(41s).sentence, "No data for 41 s: there is no connection to the daemon.");
}

TEST_F(LinkWatchTest, AnotherTechnology) {
  arrive(0s);
  watch_.hear({.technology = "kTelvonLogChannelTechnology_Orvane_GSM", .panes = "Orvane_LTE"});
  EXPECT_EQ(at(1s).state, LinkState::otherTechnology);
  EXPECT_EQ(at(1s).words, "daemon now GSM, panes are LTE's");
  EXPECT_EQ(at(1s).shortly, "now GSM");
  EXPECT_EQ(at(1s).sentence, "The daemon now speaks GSM; the panes show what came of LTE.");
}

TEST_F(LinkWatchTest, HeldAndRecorded) {
  arrive(0s);
  watch_.hear({.source = LinkReport::Source::held});
  EXPECT_EQ(at(41s).state, LinkState::held);
  EXPECT_EQ(at(41s).words, "held at 12:00:41");
  watch_.hear({.source = LinkReport::Source::file});
  EXPECT_EQ(at(41s).state, LinkState::file);
  EXPECT_EQ(at(41s).words, "recorded 12:00:41");
  EXPECT_EQ(at(41s).sentence, "A recorded drive, at 12:00:41.");
}

TEST_F(LinkWatchTest, CountsWhatIsNotShown) {
  for (int message = 0; message < 98; ++message) arrive(0s);
  EXPECT_EQ(at(0s).counters, "98 messages");
  arrive(0s, Outcome::notAskedFor);
  arrive(0s, Outcome::tooShort);
  EXPECT_EQ(at(0s).messages, 100U);
  EXPECT_EQ(at(0s).notShown, 2U);
  EXPECT_EQ(at(0s).counters, "100 messages, 2 % not shown");
}

TEST_F(LinkWatchTest, GoesOnCountingWithAnotherGenerator) {
  for (int message = 0; message < 5; ++message) arrive(0s);
  arrive(0s, Outcome::tooShort);
  intake_ = Intake();
  arrive(1s);
  EXPECT_EQ(at(1s).messages, 7U);
  EXPECT_EQ(at(1s).notShown, 1U);
}

TEST(TechnologyWord, IsWhatPeopleSay) {
  EXPECT_EQ(technologyWord("Orvane_GSM"), "GSM");
  EXPECT_EQ(technologyWord("Orvane_CDMA"), "CDMA");
  EXPECT_EQ(technologyWord("Orvane_UTRAN2"), "UTRAN");
  EXPECT_EQ(technologyWord("kTelvonLogChannelTechnology_IFX"), "IFX");
  EXPECT_EQ(technologyWord("Other"), "Other");
}

TEST(LinkState, EveryOneHasAName) {
  for (int state = 0; state < 8; ++state) EXPECT_NE(nameOf(static_cast<LinkState>(state)), "");
}

}  // namespace
}  // namespace kelvasi::cockpit
