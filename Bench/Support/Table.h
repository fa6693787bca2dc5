// SPDX-License-Identifier: Apache-2.0
// The table that the benchmarks fill: a row per measurement, each the median of its repetitions.
#pragma once

#include <benchmark/benchmark.h>

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <vector>

namespace kelvasi::bench {

// Runs the measured loop and ends with `report`.
using Work = std::function<void(benchmark::State& state)>;

// Tells a row its rate and its allocations, from what the whole loop did.
void report(benchmark::State& state, std::uint64_t items, std::uint64_t allocations);

struct Measurement {
  std::string name;
  Work work;
  Work copy = {};   // memcpy of the same bytes, item by item
  Work plain = {};  // the same rows through snprintf into std::map<std::string, std::string>
  // For work on more than this thread: measured in elapsed time, in this many iterations. 0 is measured in
  // processor time, in as many iterations as a stable figure takes.
  int iterations = 0;
};

class Table : public benchmark::BenchmarkReporter {
 public:
  void add(const Measurement& measurement);

  bool ReportContext(const Context& context) override;
  void ReportRuns(const std::vector<Run>& runs) override;
  void Finalize() override;

  // Whether all that ran gave a figure.
  bool isComplete() const { return faults_ == 0; }

 private:
  struct Figures {
    std::vector<double> rates;        // items per second
    std::vector<double> allocations;  // per item
  };

  void registerWork(const std::string& name, const Work& work, int iterations);
  const Figures* figuresOf(const std::string& name) const;
  std::vector<std::string> cellsOf(const std::string& name) const;

  std::vector<std::string> names_;
  std::map<std::string, Figures> figures_;
  int faults_ = 0;
};

}  // namespace kelvasi::bench
