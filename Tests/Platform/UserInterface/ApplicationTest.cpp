// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/Application.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

namespace kelvasi {
namespace {

struct Both : Application, ApplicationDelegate {
  ApplicationDelegate* asDelegate() override { return this; }
  void applicationDidFinishLaunching(Application& application) override { launched = &application; }
  void applicationWillTerminate(Application& application) override { terminated = &application; }
  Application* launched = nullptr;
  Application* terminated = nullptr;
};

struct Plain : Application {};

class ApplicationTest : public testing::Test {
 protected:
  template <typename Class>
  std::function<std::unique_ptr<Application>()> make() {
    return [this] {
      auto object = std::make_unique<Class>();
      made.push_back(object.get());
      return object;
    };
  }
  std::vector<Application*> made;
  const ApplicationClasses classes{{"Both", make<Both>()}, {"Plain", make<Plain>()}};
};

TEST_F(ApplicationTest, OneNameGivenTwiceMakesOneObject) {
  LaunchedApplication application(classes, "Both", "Both");
  application.didFinishLaunching();
  application.willTerminate();
  ASSERT_EQ(made.size(), 1U);
  EXPECT_EQ(static_cast<Both*>(made[0])->launched, made[0]);
  EXPECT_EQ(static_cast<Both*>(made[0])->terminated, made[0]);
}

TEST_F(ApplicationTest, TwoNamesMakeTwoObjects) {
  LaunchedApplication application(classes, "Plain", "Both");
  application.didFinishLaunching();
  ASSERT_EQ(made.size(), 2U);
  EXPECT_EQ(static_cast<Both*>(made[1])->launched, made[0]);
}

TEST_F(ApplicationTest, AnUnknownClassOrOneThatIsNoDelegateIsRefused) {
  EXPECT_THROW(LaunchedApplication(classes, "None", "Both"), std::invalid_argument);
  EXPECT_THROW(LaunchedApplication(classes, "Plain", "Plain"), std::invalid_argument);
}

}  // namespace
}  // namespace kelvasi
