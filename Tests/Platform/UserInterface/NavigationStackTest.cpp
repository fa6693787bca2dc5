// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/NavigationStack.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/UserInterface/MemoryUserInterface.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// Notes what it is told in the journal of the toolkit.
class NotingController : public ViewController {
 public:
  NotingController(test::Journal& journal, const char* name)
      : ViewController(std::make_unique<test::MemoryTableBody>()), journal_(journal), name_(name) {
    setTitle(name);
  }
  ~NotingController() override { note("destroyed"); }
  void viewDidLoad() override { note("loaded"); }
  void viewWillAppear(bool) override { note("appears"); }
  void viewWillDisappear(bool) override { note("disappears"); }

 private:
  void note(const char* what) { journal_.push_back(std::string(name_) + " " + what); }
  test::Journal& journal_;
  const char* name_;
};

class NavigationStackTest : public testing::Test, protected NavigationStackDelegate {
 protected:
  NavigationStackTest() {
    stack->setDelegate(this);
    stack->willAppear();
  }
  std::unique_ptr<ViewController> controller(const char* name) {
    return std::make_unique<NotingController>(ui.journal, name);
  }
  void push(const char* name) { stack->pushViewController(controller(name), true); }
  void navigationControllerWillShowViewControllerAnimated(NavigationStack&, ViewController& shown,
                                                          bool) override {
    ui.journal.push_back("will show " + shown.title());
  }

  test::MemoryUserInterface ui;
  std::unique_ptr<NavigationStack> stack = ui.makeNavigationStack(controller("root"));
};

TEST_F(NavigationStackTest, TheRootIsLoadedAnnouncedAndShownWhenTheStackAppears) {
  EXPECT_THAT(ui.journal, ElementsAre("root loaded", "will show root", "root appears", "show root"));
}

TEST_F(NavigationStackTest, APushIsAnnouncedBeforeThePaneIsShown) {
  ui.journal.clear();
  push("pane");
  EXPECT_THAT(ui.journal, ElementsAre("root disappears", "pane loaded", "will show pane", "pane appears",
                                      "push pane (animated)"));
  EXPECT_EQ(stack->topViewController().navigationController(), stack.get());
}

TEST_F(NavigationStackTest, APopIsAnnouncedAndDestroysWhatLayAboveOnceItIsDrawn) {
  push("pane");
  push("deep");
  ui.journal.clear();
  stack->popToViewController(*stack->viewControllers().front(), true);
  EXPECT_THAT(ui.journal, ElementsAre("deep disappears", "will show root", "root appears",
                                      "pop root (animated)", "deep destroyed", "pane destroyed"));
}

TEST_F(NavigationStackTest, APopToTheTopDoesNothing) {
  ui.journal.clear();
  stack->popToViewController(stack->topViewController(), true);
  stack->popViewController(true);
  EXPECT_THAT(ui.journal, IsEmpty());
}

TEST_F(NavigationStackTest, OneModalViewAtATime) {
  const auto first = controller("first");
  const auto second = controller("second");
  ui.journal.clear();
  stack->presentModalViewController(*first, true);
  stack->presentModalViewController(*second, true);
  EXPECT_EQ(stack->modalViewController(), first.get());
  EXPECT_THAT(ui.journal, ElementsAre("first loaded", "first appears", "present (animated)"));
}

TEST_F(NavigationStackTest, ADismissedViewIsLeftToItsOwnerAndIsNotLoadedTwice) {
  const auto modal = controller("modal");
  stack->presentModalViewController(*modal, true);
  ui.journal.clear();
  stack->dismissModalViewController(true);
  stack->dismissModalViewController(true);
  stack->presentModalViewController(*modal, false);
  EXPECT_THAT(ui.journal, ElementsAre("modal disappears", "dismiss (animated)", "modal appears", "present"));
}

}  // namespace
}  // namespace kelvasi
