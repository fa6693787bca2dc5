// SPDX-License-Identifier: Apache-2.0
// The application framework on Qt.
#pragma once

#include <memory>

#include "Platform/UserInterface/Application.h"

class QApplication;

namespace kelvasi {

class QtEventLoop;

class QtApplicationFramework : public ApplicationFramework {
 public:
  // Made before anything else of Qt's; takes the options that are Qt's out of the arguments, which must
  // outlive the framework. SIGINT, SIGTERM and SIGHUP, unless that is ignored, end run() from now on.
  QtApplicationFramework(int& argumentCount, char** arguments);
  ~QtApplicationFramework() override;

  // Until the window is closed, or a signal comes.
  void run(const ApplicationClasses& classes, std::string_view applicationClass,
           std::string_view delegateClass) override;

 private:
  std::unique_ptr<QApplication> application_;
  std::unique_ptr<QtEventLoop> loop_;
};

}  // namespace kelvasi
