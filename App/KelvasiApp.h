// SPDX-License-Identifier: Apache-2.0
// The application object: builds the window and the stack of panes, runs the model and keeps every pane in
// step with it.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "App/AppPlatform.h"
#include "App/KelvasiPaneController.h"
#include "App/KelvasiSaveViewController.h"
#include "App/SaveShell.h"
#include "Model/KelvasiModel.h"
#include "Platform/DateFormatter.h"
#include "Platform/UserInterface/Application.h"
#include "Platform/UserInterface/UserInterface.h"

namespace kelvasi {

class KelvasiApp : public Application,
                   public ApplicationDelegate,
                   public NavigationStackDelegate,
                   public SaveShell {
 public:
  explicit KelvasiApp(const AppPlatform& platform) : platform_(platform) {}
  ~KelvasiApp() override { setSaveViewController(nullptr); }
  ApplicationDelegate* asDelegate() override { return this; }

  // Switches the home-screen shell's display of the signal strength.
  void _setGSMRSSI(bool isOn);
  void getSaveButtonPref();
  void getRSSIPref();
  void applicationDidFinishLaunching(Application& application) override;
  // The clean-up. Nothing calls it; the framework's notice of termination is the other operation of this
  // name.
  void applicationWillTerminate();
  using ApplicationDelegate::applicationWillTerminate;

  void showSaveView() override;
  void closeSaveView() override;
  void keepDescription(std::string description) override { keptDescription_ = std::move(description); }
  void updateStatusForViewController(KelvasiPaneController& pane);
  // After a display tick that saw new data.
  void updateViewControllerFromModel();
  void navigationControllerWillShowViewControllerAnimated(NavigationStack& navigationController,
                                                          ViewController& viewController,
                                                          bool animated) override;

  bool allowSaveButton() const override { return allowSaveButton_; }
  void setAllowSaveButton(bool allow) { allowSaveButton_ = allow; }
  Window* window() const { return window_.get(); }
  void setWindow(std::unique_ptr<Window> window) { window_ = std::move(window); }
  KelvasiSaveViewController* saveViewController() const { return saveViewController_.get(); }
  void setSaveViewController(std::unique_ptr<KelvasiSaveViewController> controller);
  const std::optional<std::string>& updateMessage() const { return updateMessage_; }
  void setUpdateMessage(std::optional<std::string> message) { updateMessage_ = std::move(message); }

  // The names of the branches that are open, from the root's child on.
  std::vector<std::string> openBranches() const;
  // Opens these with the first rows, as far as they are there and unless the user was quicker.
  void reopenBranches(std::vector<std::string> names) { branchesToOpen_ = std::move(names); }

  // Opens the panes that lead to a node of the display tree, from the root on. The row of the last pane that
  // is the node, or leads to it; nothing where the way ends before.
  std::optional<std::size_t> openPath(const std::string& nodePath);
  // The path of the node that a row of the pane on top is.
  std::string pathOfRow(std::size_t row) const;

  KelvasiModel* model() const { return model_.get(); }
  NavigationStack* navController() const { return navController_.get(); }
  bool unsetRSSI() const { return unsetRSSI_; }

 private:
  void reloadPanes();
  void openKeptBranches();

  AppPlatform platform_;
  std::unique_ptr<Window> window_;
  std::unique_ptr<NavigationStack> navController_;
  std::unique_ptr<KelvasiSaveViewController> saveViewController_;  // while it is presented
  std::unique_ptr<KelvasiModel> model_;
  bool unsetRSSI_ = false;  // this run switched the shell's display on
  bool allowSaveButton_ = false;
  std::unique_ptr<DateFormatter> dateFormatter_;
  std::optional<std::string> updateMessage_;  // the status while connected
  std::string keptDescription_;               // of a save that failed
  std::vector<std::string> branchesToOpen_;   // until there are rows
};

}  // namespace kelvasi
