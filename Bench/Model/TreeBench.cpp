// SPDX-License-Identifier: Apache-2.0
#include "Bench/Model/TreeBench.h"

#include <algorithm>
#include <iterator>

#include "Bench/LogGenerator/Decoding.h"
#include "Bench/Simulator/Drive.h"
#include "Bench/Support/Baselines.h"
#include "Model/KelvasiModelNode.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::bench {

namespace {

constexpr std::size_t messagesPerTick = 4000;  // two seconds at 2,000/s

std::size_t treeSize(const PlistValue& display) {
  PathDictionary nodes;
  KelvasiModelNode::makeTreeFromObject(display, nodes);
  return nodes.size();
}

PlistValue displayOf(Decoding& generator, const Messages& messages) {
  generator.take(messages);
  return generator.tick();
}

FilledDisplay filled(const Technology& technology) {
  Messages messages = driveOf(technology, messagesPerTick);
  Decoding generator(technology.id);
  const std::size_t nodes = treeSize(displayOf(generator, messages));
  return {technology, std::move(messages), nodes};
}

void buildTree(benchmark::State& state, const FilledDisplay& display) {
  Decoding generator(display.technology.id);
  const PlistValue shown = displayOf(generator, display.messages);
  const std::uint64_t before = test::allocationsSoFar();
  for (auto _ : state) {
    PathDictionary nodes;
    benchmark::DoNotOptimize(KelvasiModelNode::makeTreeFromObject(shown, nodes));
  }
  report(state, static_cast<std::uint64_t>(state.iterations()), test::allocationsSoFar() - before);
}

// The tree of the tick before is released within the tick, as the model does.
void tick(benchmark::State& state, const FilledDisplay& display) {
  Decoding generator(display.technology.id);
  PathDictionary nodes;
  std::uint64_t allocated = 0;
  for (auto _ : state) {
    state.PauseTiming();
    generator.take(display.messages);
    allocated -= test::allocationsSoFar();
    state.ResumeTiming();
    nodes.clear();
    benchmark::DoNotOptimize(KelvasiModelNode::makeTreeFromObject(generator.tick(), nodes));
    allocated += test::allocationsSoFar();
  }
  report(state, static_cast<std::uint64_t>(state.iterations()), allocated);
}

}  // namespace

FilledDisplay largestDisplay() {
  std::vector<FilledDisplay> displays;
  std::ranges::transform(technologies(), std::back_inserter(displays), filled);
  return std::ranges::max(displays, {}, &FilledDisplay::nodes);
}

void addTree(Table& table) {
  const FilledDisplay display = largestDisplay();
  Decoding generator(display.technology.id);
  const PlainRows rows(displayOf(generator, display.messages));
  const std::string what =
      std::string(display.technology.name) + ", " + std::to_string(display.nodes) + " nodes";
  const Work copy = copying({Bytes(rows.bytes())});
  const Work plain = showing([=] { return std::vector{rows}; });
  table.add({.name = "tree build (" + what + ")",
             .work = [=](benchmark::State& state) { buildTree(state, display); },
             .copy = copy,
             .plain = plain});
  table.add({.name = "tick with tree build (" + what + ")",
             .work = [=](benchmark::State& state) { tick(state, display); },
             .copy = copy,
             .plain = plain});
}

}  // namespace kelvasi::bench
