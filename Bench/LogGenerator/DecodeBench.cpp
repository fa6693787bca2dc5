// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/DecodeBench.h"

#include "Bench/LogGenerator/Decoding.h"
#include "Bench/Simulator/Drive.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::bench {

namespace {

constexpr std::size_t messagesPerTick = 4096;  // about 2000 a second
constexpr std::size_t driveLength = 4096;

// What a tick allocates is not the records' doing, but it takes its time.
Work decoding(std::string_view technology, Messages messages) {
  return [technology, messages = std::move(messages)](benchmark::State& state) {
    Decoding generator(technology);
    generator.take(messages);
    std::size_t place = 0;
    std::size_t sinceTick = 0;
    std::uint64_t allocated = 0 - test::allocationsSoFar();
    for (auto _ : state) {
      generator.take(messages[place]);
      if (++place == messages.size()) place = 0;
      if (++sinceTick < messagesPerTick) continue;
      sinceTick = 0;
      allocated += test::allocationsSoFar();
      generator.tick();
      allocated -= test::allocationsSoFar();
    }
    allocated += test::allocationsSoFar();
    report(state, static_cast<std::uint64_t>(state.iterations()), allocated);
  };
}

Measurement measurement(std::string name, std::string_view technology, const Messages& messages) {
  return {.name = std::move(name),
          .work = decoding(technology, messages),
          .copy = copying(messages),
          .plain = showing([=] { return rowsOfEach(technology, messages); })};
}

}  // namespace

std::vector<PlainRows> rowsOfEach(std::string_view technology, const Messages& messages) {
  std::vector<PlainRows> rows;
  for (const Bytes& message : messages) {
    Decoding generator(technology);
    generator.take(message);
    rows.emplace_back(generator.tick());
  }
  return rows;
}

void addRecordDecoding(Table& table) {
  for (const Technology& technology : technologies()) {
    for (const Sample& sample : technology.samples) {
      table.add(measurement(std::string(technology.name) + " " + std::string(sample.name), technology.id,
                            recordsOf(sample)));
    }
  }
}

void addDriveDecoding(Table& table) {
  for (const Technology& technology : technologies()) {
    const Messages messages = driveOf(technology, driveLength);
    table.add(measurement(nameOfDrive(technology, messages) + ", in memory", technology.id, messages));
  }
}

}  // namespace kelvasi::bench
