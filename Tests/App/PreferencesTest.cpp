// SPDX-License-Identifier: Apache-2.0
// The signal-strength switch of the home screen, and the clean-up that nothing calls.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/AppFixture.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* own = "org.kelvasi.Kelvasi";
constexpr const char* shell = "org.kelvasi.Homerail";
constexpr const char* key = "HomerailShowGSMRSSI";

class PreferencesTest : public testing::Test, protected test::AppFixture {};

TEST_F(PreferencesTest, AnAbsentPreferenceSwitchesTheShellsDisplayOnAndTellsIt) {
  launch();
  EXPECT_THAT(preferences.journal,
              ElementsAre("set org.kelvasi.Homerail HomerailShowGSMRSSI true", "flush org.kelvasi.Homerail",
                          "notice org.kelvasi.Homerail HomerailShowGSMRSSI"));
  EXPECT_TRUE(application.unsetRSSI());
}

TEST_F(PreferencesTest, TheDisplayIsSwitchedBeforeTheMarkerIsLookedForAndBeforeThereIsAWindow) {
  std::size_t noted = 0;
  files.asked = [&] {
    noted = preferences.journal.size();
    EXPECT_EQ(application.window(), nullptr);
  };
  launch();
  EXPECT_EQ(noted, 3U);
}

TEST_F(PreferencesTest, AFalsePreferenceSwitchesItOnToo) {
  preferences.values[{own, key}] = false;
  launch();
  EXPECT_TRUE(application.unsetRSSI());
  EXPECT_TRUE(preferences.values.at({shell, key}));
}

TEST_F(PreferencesTest, ATruePreferenceWritesNothing) {
  preferences.values[{own, key}] = true;
  launch();
  EXPECT_THAT(preferences.journal, IsEmpty());
  EXPECT_FALSE(application.unsetRSSI());
}

TEST_F(PreferencesTest, TheShellsOwnValueIsNotAsked) {
  preferences.values[{shell, key}] = true;
  launch();
  EXPECT_TRUE(application.unsetRSSI());
}

TEST_F(PreferencesTest, TheFrameworksNoticeOfTerminationCleansNothingUp) {
  launch();
  preferences.journal.clear();
  application.asDelegate()->applicationWillTerminate(application);
  EXPECT_THAT(preferences.journal, IsEmpty());
  EXPECT_TRUE(preferences.values.at({shell, key}));
  EXPECT_NE(application.window(), nullptr);
}

TEST_F(PreferencesTest, TheCleanUpSwitchesTheDisplayOffAgainAndLetsEverythingGo) {
  launch();
  application.showSaveView();
  ui.journal.clear();
  application.applicationWillTerminate();
  EXPECT_FALSE(preferences.values.at({shell, key}));
  EXPECT_EQ(application.window(), nullptr);
  EXPECT_EQ(application.saveViewController(), nullptr);
  EXPECT_FALSE(application.updateMessage());
  EXPECT_FALSE(*link.localValid);
  EXPECT_THAT(ui.journal, ElementsAre("dismiss", "window hidden", "window destroyed"));
}

TEST_F(PreferencesTest, TheCleanUpLeavesAloneADisplayThatThisRunDidNotSwitch) {
  preferences.values[{own, key}] = true;
  launch();
  application.applicationWillTerminate();
  EXPECT_THAT(preferences.journal, IsEmpty());
}

TEST_F(PreferencesTest, AfterTheCleanUpThereIsNothingToRefreshOrToSave) {
  launch();
  application.applicationWillTerminate();
  const auto journal = ui.journal;
  application.updateViewControllerFromModel();
  application.showSaveView();
  EXPECT_EQ(application.saveViewController(), nullptr);
  EXPECT_EQ(ui.journal, journal);
}

TEST_F(PreferencesTest, AnEndBeforeTheFirstConnectionConnectsNoMore) {
  application.applicationDidFinishLaunching(application);
  application.applicationWillTerminate();
  queue.runPosted();
  EXPECT_THAT(link.localPortNames, IsEmpty());
}

}  // namespace
}  // namespace kelvasi
