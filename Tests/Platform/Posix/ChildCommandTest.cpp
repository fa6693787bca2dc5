// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/ChildCommand.h"

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

namespace kelvasi {
namespace {

using namespace std::chrono_literals;

// A shell script of a test; what is run is the interpreter itself.
std::vector<std::string> script(const std::string& text) {
  return {"sh", "-c", text};
}

bool hasChildren() {
  return ::waitpid(-1, nullptr, WNOHANG) != -1 || errno != ECHILD;
}

class ChildCommandTest : public testing::Test {
 protected:
  ~ChildCommandTest() override { std::filesystem::remove(file_); }

  std::string written() const {
    std::ostringstream text;
    text << std::ifstream(file_).rdbuf();
    return text.str();
  }

  const std::string file_ =
      testing::TempDir() + "child-" + testing::UnitTest::GetInstance()->current_test_info()->name();
};

TEST_F(ChildCommandTest, ItHasItsArgumentsAndItsVariables) {
  ChildCommand command(
      {"sh", "-c", "printf '%s|%s|%s' \"$1\" \"$VALUE\" \"$HOME\" > " + file_, "sh", "a b; c $HOME"});
  ASSERT_EQ(command.start({{"VALUE", "-115; rm 'x' $(y)"}}), std::nullopt);
  command.wait();
  EXPECT_EQ(written(),
            "a b; c $HOME|-115; rm 'x' $(y)|" + std::string(std::getenv("HOME") ? std::getenv("HOME") : ""));
  EXPECT_EQ(command.failures(), 0U);
}

TEST_F(ChildCommandTest, AVariableIsThereOnce) {
  ::setenv("KELVASI_TEST_VARIABLE", "old", 1);
  ChildCommand command(script("env | grep KELVASI_TEST_VARIABLE > " + file_));
  ASSERT_EQ(command.start({{"KELVASI_TEST_VARIABLE", "new"}}), std::nullopt);
  command.wait();
  EXPECT_EQ(written(), "KELVASI_TEST_VARIABLE=new\n");
}

TEST_F(ChildCommandTest, ItReadsNothing) {
  ChildCommand command(script("wc -c > " + file_));
  ASSERT_EQ(command.start({}), std::nullopt);
  command.wait();
  EXPECT_EQ(std::stoi(written()), 0);
}

TEST_F(ChildCommandTest, WhatIsNotThereIsSaid) {
  ChildCommand command({"/nowhere/notify"});
  EXPECT_EQ(command.start({}), "/nowhere/notify: No such file or directory");
  EXPECT_FALSE(command.isRunning());
}

TEST_F(ChildCommandTest, AFailureIsCounted) {
  ChildCommand command(script("exit 3"));
  ASSERT_EQ(command.start({}), std::nullopt);
  command.wait();
  ASSERT_EQ(command.start({}), std::nullopt);
  command.wait();
  EXPECT_EQ(command.failures(), 2U);
}

TEST_F(ChildCommandTest, NothingIsLeftBehind) {
  ChildCommand command(script("exit 0"));
  ASSERT_EQ(command.start({}), std::nullopt);
  while (command.isRunning()) {
  }
  EXPECT_FALSE(hasChildren());
}

TEST_F(ChildCommandTest, OneThatRunsOnIsEnded) {
  {
    ChildCommand command({"sleep", "1000"});
    ASSERT_EQ(command.start({}), std::nullopt);
    EXPECT_TRUE(command.isRunning());
  }
  EXPECT_FALSE(hasChildren());
}

TEST_F(ChildCommandTest, OneThatDoesNotListenIsEndedToo) {
  ChildCommand command(script("trap '' TERM; echo ready > " + file_ + "; while :; do sleep 0.1; done"));
  ASSERT_EQ(command.start({}), std::nullopt);
  while (written().empty()) {
  }
  command.end(0ms);
  EXPECT_FALSE(command.isRunning());
  EXPECT_FALSE(hasChildren());
  EXPECT_EQ(command.failures(), 1U);
}

}  // namespace
}  // namespace kelvasi
