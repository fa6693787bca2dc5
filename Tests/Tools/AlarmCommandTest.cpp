// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/AlarmCommand.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <sstream>

namespace kelvasi {
namespace {

using namespace std::chrono_literals;
using WhenBusy = AlarmCommand::WhenBusy;

class AlarmCommandTest : public testing::Test {
 protected:
  ~AlarmCommandTest() override { std::filesystem::remove(file_); }

  std::vector<std::string> script(const std::string& text) const {
    return {"sh", "-c", "printf '%s ' \"$KELVASI_ALARM_VALUE\" >> " + file_ + "; " + text};
  }
  std::string written() const {
    std::ostringstream text;
    text << std::ifstream(file_).rdbuf();
    return text.str();
  }
  static Json alarm(double value) { return {{"value", value}, {"cell", nullptr}}; }

  const std::string file_ =
      testing::TempDir() + "alarm-" + testing::UnitTest::GetInstance()->current_test_info()->name();
};

TEST_F(AlarmCommandTest, MembersOfTheRecordAreVariables) {
  const Json alarm{{"rule", "rsrp < -115; rm *"}, {"value", -116.5}, {"cell", nullptr}, {"held_back", 3}};
  EXPECT_EQ(AlarmCommand::variablesOf(alarm),
            (ChildCommand::Variables{{"KELVASI_ALARM_RULE", "rsrp < -115; rm *"},
                                     {"KELVASI_ALARM_VALUE", "-116.5"},
                                     {"KELVASI_ALARM_CELL", ""},
                                     {"KELVASI_ALARM_HELD_BACK", "3"}}));
}

TEST_F(AlarmCommandTest, ItRunsForEachAlarmInOrder) {
  AlarmCommand command(script("sleep 0.05"), 0s, WhenBusy::wait);
  for (int number = 1; number <= 3; ++number) command.run(alarm(number), number * 1s);
  command.finish();
  EXPECT_EQ(written(), "1.0 2.0 3.0 ");
  EXPECT_TRUE(command.isWell());
}

TEST_F(AlarmCommandTest, AtMostSoOften) {
  AlarmCommand command(script(""), 10s, WhenBusy::wait);
  command.run(alarm(1), 100s);
  command.run(alarm(2), 109s);
  command.run(alarm(3), 110s);
  command.run(alarm(4), 50s);  // another capture
  testing::internal::CaptureStderr();
  command.finish();
  EXPECT_EQ(testing::internal::GetCapturedStderr(),
            "kelvasictl: 1 alarm came while the command ran or too soon after it, and went without\n");
  EXPECT_EQ(written(), "1.0 3.0 4.0 ");
}

TEST_F(AlarmCommandTest, OneAtATimeWhereNobodyCanWait) {
  AlarmCommand command(script("sleep 0.5"), 0s, WhenBusy::leaveOut);
  command.run(alarm(1), 1s);
  command.run(alarm(2), 2s);
  command.finish();
  EXPECT_EQ(written(), "1.0 ");
}

TEST_F(AlarmCommandTest, AFailureIsSaid) {
  testing::internal::CaptureStderr();
  AlarmCommand command(script("exit 1"), 0s, WhenBusy::wait);
  command.run(alarm(1), 1s);
  command.finish();
  AlarmCommand missing({"/nowhere/notify"}, 0s, WhenBusy::wait);
  missing.run(alarm(1), 1s);
  missing.run(alarm(2), 2s);
  missing.finish();
  EXPECT_EQ(testing::internal::GetCapturedStderr(),
            "kelvasictl: the command failed in 1 run\n"
            "kelvasictl: /nowhere/notify: No such file or directory\n");
  EXPECT_FALSE(command.isWell());
  EXPECT_FALSE(missing.isWell());
}

}  // namespace
}  // namespace kelvasi
