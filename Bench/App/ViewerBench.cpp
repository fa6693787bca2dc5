// SPDX-License-Identifier: Apache-2.0
#include "Bench/App/ViewerBench.h"

#include <QApplication>
#include <array>
#include <cstdlib>
#include <fstream>
#include <optional>
#include <ranges>
#include <string>
#include <vector>

#include "App/KelvasiPaneController.h"
#include "Bench/LogGenerator/Decoding.h"
#include "Bench/Model/TreeBench.h"
#include "Bench/Support/Process.h"
#include "Model/KelvasiModelNode.h"
#include "Platform/QtWidgets/QtUserInterface.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::bench {

namespace {

constexpr const char* stateScript = KELVASI_BENCH_CAPTURES "/state.script";

// Qt's, without a display. One at a time.
struct Gui {
  Gui() : application(count, arguments.data()) {}

  int count = 1;
  std::array<char, 6> name{"bench"};
  std::array<char*, 2> arguments{name.data(), nullptr};
  QApplication application;
  QtUserInterface ui{{.colourScheme = ColourScheme::light, .animates = false}};
};

struct NoSave : SaveShell {
  bool allowSaveButton() const override { return true; }
  void showSaveView() override {}
  void closeSaveView() override {}
  void keepDescription(std::string) override {}
};

// The path of the branch with the most rows.
std::string fullestPath(const PathDictionary& nodes) {
  const auto rows = [](const auto& entry) {
    return entry.second->childNodes() ? entry.second->childNodes()->size() : 0;
  };
  return std::ranges::max_element(nodes, {}, rows)->first;
}

// Root pane and, over it, the pane with the most rows, which is seen.
class Panes {
 public:
  Panes(Gui& gui, const PathDictionary& nodes) : path_(fullestPath(nodes)) {
    auto root = std::make_unique<KelvasiPaneController>(gui.ui, shell_, nodes.at("/"), "/");
    stack_ = gui.ui.makeNavigationStack(std::move(root));
    window_ = gui.ui.makeWindow({0, 0, 390, 844});
    window_->setRootViewController(*stack_);
    window_->addSubview(stack_->view());
    window_->makeKeyAndVisible();
    stack_->pushViewController(
        std::make_unique<KelvasiPaneController>(gui.ui, shell_, nodes.at(path_), path_), false);
    QCoreApplication::processEvents();
  }

  // What the application does at a tick, and what is painted for it.
  void reload(const PathDictionary& nodes, const std::string& status) {
    pane(0).reloadWithNode(nodes.at("/"));
    pane(1).reloadWithNode(nodes.at(path_));
    pane(1).setStatus(status, false);
    QCoreApplication::processEvents();
  }

 private:
  KelvasiPaneController& pane(std::size_t place) const {
    return static_cast<KelvasiPaneController&>(*stack_->viewControllers()[place]);
  }

  std::string path_;
  NoSave shell_;
  std::unique_ptr<NavigationStack> stack_;
  std::unique_ptr<Window> window_;
};

void tickToPainted(benchmark::State& state, const FilledDisplay& display) {
  Gui gui;
  Decoding generator(display.technology.id);
  generator.take(display.messages);
  PathDictionary nodes;
  KelvasiModelNode::makeTreeFromObject(generator.tick(), nodes);
  Panes panes(gui, nodes);
  std::uint64_t allocated = 0;
  int update = 0;
  for (auto _ : state) {
    state.PauseTiming();
    generator.take(display.messages);
    const std::string status = "Updated 2024-03-05 at 14:07:" + std::to_string(10 + ++update % 50);
    allocated -= test::allocationsSoFar();
    state.ResumeTiming();
    nodes.clear();
    KelvasiModelNode::makeTreeFromObject(generator.tick(), nodes);
    panes.reload(nodes, status);
    allocated += test::allocationsSoFar();
  }
  report(state, static_cast<std::uint64_t>(state.iterations()), allocated);
}

// From the start of the process until the first pane is shown and its contents could be asked for.
void startViewer(benchmark::State& state) {
  std::ofstream(stateScript) << "state\n";
  const PrivateRuntimeDirectory runtime;
  for (auto _ : state) {
    std::optional<Process> viewer(std::in_place, KELVASI_BENCH_VIEWER,
                                  std::vector<std::string>{"--script", stateScript},
                                  Process::Output::talking);
    if (!viewer->waitForOutput()) return state.SkipWithError("the viewer showed nothing");
    state.PauseTiming();
    viewer.reset();
    state.ResumeTiming();
  }
  state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}

}  // namespace

void addViewer(Table& table, bool isSmoke) {
  ::setenv("QT_QPA_PLATFORM", "offscreen", 1);
  ::setenv("XDG_CONFIG_HOME", KELVASI_BENCH_CAPTURES, 1);  // the user's preferences stay as they are
  const FilledDisplay display = largestDisplay();
  table.add({.name = "kelvasi: tick to painted rows (" + std::string(display.technology.name) + ", " +
                     std::to_string(display.nodes) + " nodes)",
             .work = [=](benchmark::State& state) { tickToPainted(state, display); }});
  table.add({.name = "kelvasi: start to first pane, whole process",
             .work = startViewer,
             .iterations = isSmoke ? 1 : 10});
}

}  // namespace kelvasi::bench
