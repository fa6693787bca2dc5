// SPDX-License-Identifier: Apache-2.0
#include "Bench/Tools/DecodeToolBench.h"

#include "Bench/Capture/WrittenDrive.h"
#include "Bench/LogGenerator/DecodeBench.h"
#include "Bench/Simulator/Drive.h"
#include "Bench/Support/Process.h"
#include "Bench/Support/Surroundings.h"
#include "Telvon/Technology.h"
#include "Tests/Support/AllocationCounter.h"
#include "Tools/Kelvasictl/Decode.h"

namespace kelvasi::bench {

namespace {

constexpr std::size_t comparedMessages = 1024;

// One capture an iteration, from opening the file to the last tick's display.
void decodeFile(benchmark::State& state, const Technology& technology, std::size_t size) {
  const std::string path = writeDrive(technology, size);
  Surroundings surroundings;
  PushedClock clock(surroundings.clock);
  const std::uint64_t before = test::allocationsSoFar();
  for (auto _ : state) {
    Decode decode(LogGenerator::generatorFromTechnology(technology.id, surroundings.platform()), clock,
                  [](TickSchedule::Time, const PlistValue&) {});
    const auto capture = openCapture(path, surroundings.platform().plists);
    while (const auto message = capture->next()) decode.take(*message);
    decode.finish();
    if (capture->fault() || !decode.display()) return state.SkipWithError("the capture was not decoded");
  }
  report(state, static_cast<std::uint64_t>(state.iterations()) * size, test::allocationsSoFar() - before);
}

void startTool(benchmark::State& state) {
  const Technology& technology = technologies().front();
  const std::string path = writeDrive(technology, 100);
  for (auto _ : state) {
    Process tool(KELVASI_BENCH_TOOL, {"decode", "--technology", std::string(technology.id), path},
                 Process::Output::dropped);
    if (!tool.waitForSuccess()) return state.SkipWithError("the tool failed");
  }
  state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}

}  // namespace

void addCaptureDecoding(Table& table, bool isSmoke) {
  const std::size_t size = isSmoke ? 500 : 100000;
  for (const Technology& technology : technologies()) {
    const Messages compared = driveOf(technology, comparedMessages);
    table.add({.name = nameOfDrive(technology, compared) + ", pcap file to display",
               .work = [=](benchmark::State& state) { decodeFile(state, technology, size); },
               .copy = copying(compared),
               .plain = showing([=] { return rowsOfEach(technology.id, compared); })});
  }
}

void addToolStart(Table& table, bool isSmoke) {
  table.add({.name = "kelvasictl decode of 100 messages, whole process",
             .work = startTool,
             .iterations = isSmoke ? 1 : 20});
}

}  // namespace kelvasi::bench
