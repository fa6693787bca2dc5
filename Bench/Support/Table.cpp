// SPDX-License-Identifier: Apache-2.0
#include "Bench/Support/Table.h"

#include <algorithm>
#include <ostream>

#include "Bench/Support/Text.h"

namespace kelvasi::bench {

namespace {

constexpr std::string_view copySuffix = " / memcpy";
constexpr std::string_view plainSuffix = " / snprintf";
constexpr const char* allocationsCounter = "allocations";
constexpr const char* rateCounter = "items_per_second";  // what SetItemsProcessed fills

const std::vector<std::string> header{"measured",  "per second", "each",
                                      "allocated", "of memcpy",  "of snprintf + map"};

double median(std::vector<double> values) {
  std::ranges::sort(values);
  const std::size_t middle = values.size() / 2;
  return values.size() % 2 != 0 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

}  // namespace

void report(benchmark::State& state, std::uint64_t items, std::uint64_t allocations) {
  state.SetItemsProcessed(static_cast<std::int64_t>(items));
  state.counters[allocationsCounter] = static_cast<double>(allocations) / static_cast<double>(items);
}

void Table::add(const Measurement& measurement) {
  names_.push_back(measurement.name);
  registerWork(measurement.name, measurement.work, measurement.iterations);
  if (measurement.copy) registerWork(measurement.name + std::string(copySuffix), measurement.copy, 0);
  if (measurement.plain) registerWork(measurement.name + std::string(plainSuffix), measurement.plain, 0);
}

void Table::registerWork(const std::string& name, const Work& work, int iterations) {
  auto* registered = benchmark::RegisterBenchmark(name.c_str(), work);
  if (iterations != 0) registered->UseRealTime()->Iterations(iterations);
}

bool Table::ReportContext(const Context& context) {
  GetOutputStream() << context.cpu_info.num_cpus << " processors; medians of the repetitions\n";
  return true;
}

void Table::ReportRuns(const std::vector<Run>& runs) {
  for (const Run& run : runs) {
    if (run.run_type != Run::RT_Iteration) continue;
    if (run.error_occurred || !run.counters.contains(rateCounter)) {
      GetErrorStream() << run.benchmark_name() << ": " << run.error_message << "\n";
      ++faults_;
      continue;
    }
    Figures& figures = figures_[run.run_name.function_name];
    figures.rates.push_back(run.counters.at(rateCounter));
    if (run.counters.contains(allocationsCounter))
      figures.allocations.push_back(run.counters.at(allocationsCounter));
  }
}

const Table::Figures* Table::figuresOf(const std::string& name) const {
  const auto found = figures_.find(name);
  return found == figures_.end() ? nullptr : &found->second;
}

std::vector<std::string> Table::cellsOf(const std::string& name) const {
  const Figures& own = *figuresOf(name);
  const double rate = median(own.rates);
  std::vector<std::string> cells{name, grouped(rate), duration(1 / rate),
                                 own.allocations.empty() ? "" : fixed(median(own.allocations), 3)};
  for (const std::string_view suffix : {copySuffix, plainSuffix}) {
    const Figures* other = figuresOf(name + std::string(suffix));
    cells.push_back(other ? ratio(rate / median(other->rates)) : "");
  }
  return cells;
}

void Table::Finalize() {
  std::vector<std::vector<std::string>> lines{header};
  for (const std::string& name : names_) {
    if (figuresOf(name)) lines.push_back(cellsOf(name));
  }
  GetOutputStream() << aligned(lines);
}

}  // namespace kelvasi::bench
