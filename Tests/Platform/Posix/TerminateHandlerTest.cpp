// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TerminateHandler.h"

#include <gtest/gtest.h>

#include <csignal>
#include <stdexcept>

#include "Platform/Posix/SystemLogs.h"

namespace kelvasi {

class SpokenException : public std::runtime_error {
  using std::runtime_error::runtime_error;
};
struct SilentException {};

namespace {

template <typename Exception>
void raise(const Exception& exception) {
  throw exception;
}

// Fails where it may not, which terminates once more.
class BrokenLog : public SystemLog {
 public:
  bool wants(LogPriority) const override { return true; }
  void write(LogPriority, std::string_view) noexcept override { raise(std::runtime_error("log")); }
};

template <typename Exception>
void endWith(const Exception& exception, LogLevel level = LogLevel()) {
  static StderrSystemLog log(level);
  installTerminateHandler(log);
  [&]() noexcept { raise(exception); }();
}

const auto aborted = ::testing::KilledBySignal(SIGABRT);

TEST(TerminateHandlerDeathTest, NamesTheExceptionAndWhatItSays) {
  EXPECT_EXIT(endWith(SpokenException("index 7 of 3")), aborted,
              "^<2>Terminating: uncaught kelvasi::SpokenException: index 7 of 3\n$");
}

TEST(TerminateHandlerDeathTest, NamesAnExceptionThatSaysNothing) {
  EXPECT_EXIT(endWith(SilentException()), aborted, "^<2>Terminating: uncaught kelvasi::SilentException\n$");
  EXPECT_EXIT(endWith(7), aborted, "^<2>Terminating: uncaught int\n$");
}

TEST(TerminateHandlerDeathTest, WorksWithoutAnException) {
  static StderrSystemLog log{LogLevel()};
  EXPECT_EXIT((installTerminateHandler(log), std::terminate()), aborted,
              "^<2>Terminating: no exception is under way\n$");
}

TEST(TerminateHandlerDeathTest, AMaskedLogStillAborts) {
  EXPECT_EXIT(endWith(SilentException(), LogLevel("emerg")), aborted, "^$");
}

// One that goes elsewhere.
class SilentLog : public SystemLog {
 public:
  bool wants(LogPriority) const override { return true; }
  void write(LogPriority, std::string_view) override {}
};

TEST(TerminateHandlerDeathTest, TellsTheUserTooWhereTheLogGoesElsewhere) {
  static SilentLog log;
  const auto end = [](const auto& exception) {
    installTerminateHandler(log, "program");
    [&]() noexcept { raise(exception); }();
  };
  EXPECT_EXIT(end(SpokenException("index 7 of 3")), aborted,
              "^program: Terminating: uncaught kelvasi::SpokenException: index 7 of 3\n$");
  EXPECT_EXIT(end(SpokenException("two\nlines")), aborted,
              "^program: Terminating: uncaught kelvasi::SpokenException: two lines\n$");
}

TEST(TerminateHandlerDeathTest, TellsTheUserBeforeALogThatFails) {
  static BrokenLog log;
  EXPECT_EXIT((installTerminateHandler(log, "program"), std::terminate()), aborted,
              "^program: Terminating: no exception is under way\n$");
}

TEST(TerminateHandlerDeathTest, ALogThatFailsItselfStillAborts) {
  static BrokenLog log;
  EXPECT_EXIT((installTerminateHandler(log), std::terminate()), aborted, "^$");
}

}  // namespace
}  // namespace kelvasi
