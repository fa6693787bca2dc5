// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/QtApplicationFramework.h"

#include <QApplication>

#include "Platform/Qt/EndingSignals.h"
#include "Platform/Qt/QtEventLoop.h"

namespace kelvasi {

namespace {

// Threads that Qt starts with the application leave the signals to the event loop.
std::unique_ptr<QApplication> makeApplication(int& argumentCount, char** arguments) {
  const sigset_t ending = endingSignals();
  sigset_t before;
  ::pthread_sigmask(SIG_BLOCK, &ending, &before);
  auto application = std::make_unique<QApplication>(argumentCount, arguments);
  ::pthread_sigmask(SIG_SETMASK, &before, nullptr);
  return application;
}

}  // namespace

QtApplicationFramework::QtApplicationFramework(int& argumentCount, char** arguments)
    : application_(makeApplication(argumentCount, arguments)), loop_(std::make_unique<QtEventLoop>()) {
  QApplication::setApplicationName(QStringLiteral("Kelvasi"));
  QApplication::setDesktopFileName(QStringLiteral("org.kelvasi.Kelvasi"));
}

// Qt's part for Wayland may wait for a thread of its own for ever when it goes. The end of the process takes
// it.
QtApplicationFramework::~QtApplicationFramework() {
  loop_.reset();
  if (QGuiApplication::platformName().startsWith(QLatin1String("wayland")))
    static_cast<void>(application_.release());
}

void QtApplicationFramework::run(const ApplicationClasses& classes, std::string_view applicationClass,
                                 std::string_view delegateClass) {
  LaunchedApplication launched(classes, applicationClass, delegateClass);
  launched.didFinishLaunching();
  loop_->run();
  launched.willTerminate();
}

}  // namespace kelvasi
