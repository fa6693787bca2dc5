// SPDX-License-Identifier: Apache-2.0
// Runs the benchmarks and prints their table. `--smoke` runs each as briefly as it can be;
// `--count-instructions` does the work that Bench/instructions counts, and measures nothing; what else is
// given goes to the benchmark library, as in --benchmark_filter=tree.
#include <cstring>
#include <vector>

#include "Bench/App/ViewerBench.h"
#include "Bench/Instructions/InstructionCount.h"
#include "Bench/LogGenerator/DecodeBench.h"
#include "Bench/Model/TreeBench.h"
#include "Bench/Platform/ChannelBench.h"
#include "Bench/Platform/ChannelPeer.h"
#include "Bench/Tools/DecodeToolBench.h"
#include "Bench/Tools/DriveBench.h"

using namespace kelvasi::bench;

namespace {

std::vector<const char*> libraryArguments(int count, char** arguments, bool isSmoke) {
  std::vector<const char*> all{arguments[0]};
  if (isSmoke) {
    all.push_back("--benchmark_min_time=0");
  } else {
    all.insert(all.end(), {"--benchmark_min_time=0.05", "--benchmark_repetitions=5",
                           "--benchmark_enable_random_interleaving=true"});
  }
  for (int at = 1; at < count; ++at) {
    if (std::strcmp(arguments[at], "--smoke") != 0) all.push_back(arguments[at]);
  }
  return all;
}

}  // namespace

int main(int count, char** arguments) {
  if (count > 1 && std::strcmp(arguments[1], "--peer") == 0) return runChannelPeer();
  if (count > 1 && std::strcmp(arguments[1], "--count-instructions") == 0) {
    countInstructions();
    return 0;
  }
  if (count == 4 && std::strcmp(arguments[1], "--drive") == 0)
    return measureDrive(arguments[2], arguments[3]) ? 0 : 1;
  const bool isSmoke = count > 1 && std::strcmp(arguments[1], "--smoke") == 0;
  auto all = libraryArguments(count, arguments, isSmoke);
  int allCount = static_cast<int>(all.size());
  benchmark::Initialize(&allCount, const_cast<char**>(all.data()));
  if (benchmark::ReportUnrecognizedArguments(allCount, const_cast<char**>(all.data()))) return 2;
  Table table;
  addRecordDecoding(table);
  addDriveDecoding(table);
  addCaptureDecoding(table, isSmoke);
  addTree(table);
  addChannel(table, isSmoke);
  addToolStart(table, isSmoke);
  addViewer(table, isSmoke);
  benchmark::RunSpecifiedBenchmarks(&table);
  return table.isComplete() ? 0 : 1;
}
