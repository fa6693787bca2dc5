// SPDX-License-Identifier: Apache-2.0
// A runtime directory, an event loop and a log of the test's own.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <string_view>

#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Tests/Support/RecordingLog.h"

namespace kelvasi::test {

class PortTest : public testing::Test {
 protected:
  PortTest() {
    std::string pattern = (std::filesystem::temp_directory_path() / "kelvasi-XXXXXX").string();
    directory = ::mkdtemp(pattern.data());
    ::setenv("TELVON_RUNTIME_DIR", directory.c_str(), 1);
  }
  ~PortTest() override { std::filesystem::remove_all(directory); }

  // Runs the event loop until the condition holds; false when it does not within a minute.
  template <typename Condition>
  static bool runUntil(Condition condition) {
    const QDeadlineTimer limit(std::chrono::minutes(1));
    while (!condition() && !limit.hasExpired()) QCoreApplication::processEvents(QEventLoop::AllEvents, 100);
    return condition();
  }
  // Lets everything happen that can happen at once.
  static void runWhatIsDue() {
    for (int turn = 0; turn < 10; ++turn) QCoreApplication::processEvents();
  }

  QtEventLoop loop;
  std::string directory;
  RecordingLog log;
  QtMessagePorts ports{log};
};

inline std::string textOf(std::span<const std::uint8_t> bytes) {
  return {bytes.begin(), bytes.end()};
}

inline Bytes bytesOf(std::string_view text) {
  return {text.begin(), text.end()};
}

}  // namespace kelvasi::test
