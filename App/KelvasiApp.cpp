// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiApp.h"

#include <utility>

#include "Platform/Clock.h"
#include "Platform/Files.h"
#include "Platform/MainQueue.h"
#include "Platform/Preferences.h"

namespace kelvasi {

namespace {

// The switch is read from this application's domain and written to the home-screen shell's: two domains on
// purpose.
constexpr const char* ownDomain = "org.kelvasi.Kelvasi";
constexpr const char* shellDomain = "org.kelvasi.Homerail";
constexpr const char* rssiKey = "HomerailShowGSMRSSI";

constexpr const char* connecting = "Connecting...";
constexpr const char* updatePattern = "'Updated' yyyy-MM-dd 'at' HH:mm:ss";

// Only panes are ever put on the stack.
KelvasiPaneController& asPane(ViewController& controller) {
  return dynamic_cast<KelvasiPaneController&>(controller);
}

}  // namespace

void KelvasiApp::_setGSMRSSI(bool isOn) {
  Preferences& preferences = platform_.shell.preferences;
  preferences.setBoolean(shellDomain, rssiKey, isOn);
  preferences.flush(shellDomain);
  preferences.postChangeNotice(shellDomain, rssiKey);
}

void KelvasiApp::getSaveButtonPref() {
  allowSaveButton_ = platform_.shell.files.exists(platform_.paths.internalInstallMarker);
}

void KelvasiApp::getRSSIPref() {
  if (platform_.shell.preferences.boolean(ownDomain, rssiKey).value_or(false)) return;
  unsetRSSI_ = true;
  _setGSMRSSI(true);
}

void KelvasiApp::applicationDidFinishLaunching(Application&) {
  UserInterface& ui = platform_.shell.ui;
  getRSSIPref();
  getSaveButtonPref();
  window_ = ui.makeWindow(ui.mainScreen().bounds());
  model_ = std::make_unique<KelvasiModel>(platform_.core, platform_.link,
                                          [this] { updateViewControllerFromModel(); });
  updateMessage_ = connecting;
  dateFormatter_ = platform_.shell.dateFormatters.makeDateFormatter(updatePattern);
  auto root = std::make_unique<KelvasiPaneController>(ui, *this, nullptr, "/");
  root->setStatus("Connecting", true);
  navController_ = ui.makeNavigationStack(std::move(root));
  navController_->setDelegate(this);
  window_->setRootViewController(*navController_);
  window_->addSubview(navController_->view());
  window_->makeKeyAndVisible();
  platform_.link.queue.post([this] {
    if (model_) model_->restartMonitor();
  });
}

void KelvasiApp::applicationWillTerminate() {
  if (unsetRSSI_) _setGSMRSSI(false);
  updateMessage_.reset();
  dateFormatter_.reset();
  setSaveViewController(nullptr);
  if (window_) window_->orderOut();
  setWindow(nullptr);
  model_.reset();
}

void KelvasiApp::showSaveView() {
  if (saveViewController_ || !model_) return;
  saveViewController_ =
      std::make_unique<KelvasiSaveViewController>(platform_, *this, model_->getSaveContents());
  if (!keptDescription_.empty()) saveViewController_->saveDescription().setText(keptDescription_);
  navController_->presentModalViewController(*saveViewController_, true);
}

void KelvasiApp::closeSaveView() {
  if (!saveViewController_) return;
  navController_->dismissModalViewController(true);
  saveViewController_.reset();
}

// A view that is let go while it lies over the panes is taken away first.
void KelvasiApp::setSaveViewController(std::unique_ptr<KelvasiSaveViewController> controller) {
  if (saveViewController_ && navController_->modalViewController() == saveViewController_.get())
    navController_->dismissModalViewController(false);
  saveViewController_ = std::move(controller);
}

void KelvasiApp::updateStatusForViewController(KelvasiPaneController& pane) {
  if (model_ && model_->isConnected()) {
    pane.setStatus(updateMessage_, false);
  } else {
    pane.setStatus(connecting, true);
  }
}

void KelvasiApp::navigationControllerWillShowViewControllerAnimated(NavigationStack&,
                                                                    ViewController& viewController, bool) {
  updateStatusForViewController(asPane(viewController));
}

void KelvasiApp::updateViewControllerFromModel() {
  if (!model_) return;
  reloadPanes();
  openKeptBranches();
  if (model_->isConnected()) updateMessage_ = dateFormatter_->stringFromDate(platform_.core.clock.now());
  updateStatusForViewController(asPane(navController_->topViewController()));
}

std::vector<std::string> KelvasiApp::openBranches() const {
  std::vector<std::string> names;
  for (const auto& pane : navController_->viewControllers()) names.push_back(pane->title());
  names.erase(names.begin());
  return names;
}

std::optional<std::size_t> KelvasiApp::openPath(const std::string& nodePath) {
  navController_->popToViewController(*navController_->viewControllers().front(), false);
  for (;;) {
    KelvasiPaneController& pane = asPane(navController_->topViewController());
    const auto row = pane.rowTowards(nodePath);
    if (!row || !pane.openRow(*row)) return row;
  }
}

std::string KelvasiApp::pathOfRow(std::size_t row) const {
  return asPane(navController_->topViewController()).pathOfRow(row);
}

void KelvasiApp::openKeptBranches() {
  if (!model_->topLevelNodes()) return;
  const auto names = std::exchange(branchesToOpen_, {});
  if (navController_->viewControllers().size() > 1) return;
  for (const std::string& name : names) {
    if (!asPane(navController_->topViewController()).openBranchNamed(name)) return;
  }
}

// Root first; a pane whose branch is gone goes, with those above it, which are not reloaded.
void KelvasiApp::reloadPanes() {
  const auto& panes = navController_->viewControllers();
  asPane(*panes.front()).reloadWithNode(model_->topLevelNodes());
  for (std::size_t place = 1; place < panes.size(); ++place) {
    KelvasiPaneController& pane = asPane(*panes[place]);
    NodeRef node = model_->nodeAtPath(pane.path());
    if (!node) return navController_->popToViewController(*panes[place - 1], true);
    pane.reloadWithNode(std::move(node));
  }
}

}  // namespace kelvasi
