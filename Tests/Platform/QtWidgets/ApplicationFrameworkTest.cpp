// SPDX-License-Identifier: Apache-2.0
// The start of the application framework. Qt's application is the framework's own here, so once a process.
#include "Platform/QtWidgets/QtApplicationFramework.h"

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <array>
#include <csignal>

namespace kelvasi {

namespace {

// The signals that a thread which Qt starts with its application would hold back.
sigset_t& heldBackInQt() {
  static sigset_t mask;
  return mask;
}

void startFramework() {
  qputenv("QT_QPA_PLATFORM", "offscreen");
  qAddPreRoutine([] { ::pthread_sigmask(SIG_SETMASK, nullptr, &heldBackInQt()); });
  int count = 1;
  std::array<char, 8> name{"kelvasi"};
  std::array<char*, 2> arguments{name.data(), nullptr};
  const QtApplicationFramework framework(count, arguments.data());
}

bool isHeldBackInQt(int signal) {
  return ::sigismember(&heldBackInQt(), signal) == 1;
}

}  // namespace

TEST(ApplicationFrameworkTest, threadsOfQtLeaveTheEndingSignalsToTheEventLoop) {
  startFramework();
  EXPECT_TRUE(isHeldBackInQt(SIGINT));
  EXPECT_TRUE(isHeldBackInQt(SIGTERM));
  EXPECT_TRUE(isHeldBackInQt(SIGHUP));
}

TEST(ApplicationFrameworkTest, aHangUpThatIsIgnoredIsNotHeldBack) {
  ::signal(SIGHUP, SIG_IGN);
  startFramework();
  EXPECT_TRUE(isHeldBackInQt(SIGTERM));
  EXPECT_FALSE(isHeldBackInQt(SIGHUP));
}

}  // namespace kelvasi
