// SPDX-License-Identifier: Apache-2.0
// The application object, and how a program hands control to the application framework.
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>

namespace kelvasi {

class Application;

// Notices of the framework; the base versions do nothing.
class ApplicationDelegate {
 public:
  virtual void applicationDidFinishLaunching(Application& /*application*/) {}
  virtual void applicationWillTerminate(Application& /*application*/) {}

 protected:
  ~ApplicationDelegate() = default;
};

class Application {
 public:
  Application() = default;
  virtual ~Application() = default;
  Application(const Application&) = delete;
  Application& operator=(const Application&) = delete;

  // The delegate that this class is besides; null when it is none.
  virtual ApplicationDelegate* asDelegate() { return nullptr; }
};

// The classes that the framework can be given by name.
using ApplicationClasses = std::map<std::string, std::function<std::unique_ptr<Application>()>, std::less<>>;

// The application made of two class names. Where both name one class, one object is both.
class LaunchedApplication {
 public:
  // Throws std::invalid_argument when a class is not known or the delegate's is no delegate.
  LaunchedApplication(const ApplicationClasses& classes, std::string_view applicationClass,
                      std::string_view delegateClass);

  void didFinishLaunching() { delegate_->applicationDidFinishLaunching(*application_); }
  void willTerminate() { delegate_->applicationWillTerminate(*application_); }
  Application& application() { return *application_; }

 private:
  std::unique_ptr<Application> application_;
  std::unique_ptr<Application> otherDelegate_;  // null where the application is its own
  ApplicationDelegate* delegate_;
};

// The framework: runs the event loop of the application.
class ApplicationFramework {
 public:
  virtual ~ApplicationFramework() = default;
  // Launches, runs until the user leaves, and returns.
  virtual void run(const ApplicationClasses& classes, std::string_view applicationClass,
                   std::string_view delegateClass) = 0;
};

}  // namespace kelvasi
