// SPDX-License-Identifier: Apache-2.0
#include "Bench/Tools/DriveBench.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <functional>
#include <string_view>
#include <vector>

#include "Bench/Simulator/Drive.h"
#include "Bench/Support/Surroundings.h"
#include "Capture/CaptureReader.h"
#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/Decode.h"

namespace kelvasi::bench {

namespace {

// Messages one behind the other, as they lie in a file that is mapped.
struct Run {
  struct Place {
    std::size_t begin, size;
    std::chrono::nanoseconds arrival;
  };

  void add(std::span<const std::uint8_t> message, std::chrono::nanoseconds arrival) {
    places.push_back({bytes.size(), message.size(), arrival});
    bytes.insert(bytes.end(), message.begin(), message.end());
  }
  CapturedMessage at(const Place& place) const {
    return {.bytes = std::span(bytes).subspan(place.begin, place.size), .arrival = place.arrival};
  }

  Bytes bytes;
  std::vector<Place> places;
};

struct Drive {
  Run records;
  Run propertyLists;
};

Drive readDrive(CaptureReader& capture) {
  Drive drive;
  while (const auto message = capture.next()) {
    const auto list = propertyListIn(message->bytes);
    (list.empty() ? drive.records : drive.propertyLists)
        .add(list.empty() ? message->bytes : list, message->arrival);
  }
  return drive;
}

double seconds(const std::function<void()>& work) {
  std::array<double, 5> all{};
  for (double& each : all) {
    const std::clock_t begin = std::clock();
    work();
    each = static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC;
  }
  std::ranges::sort(all);
  return all[all.size() / 2];
}

void decode(const Run& records, std::string_view technology, Surroundings& surroundings) {
  PushedClock clock(surroundings.clock);
  Decode decoding(LogGenerator::generatorFromTechnology(technology, surroundings.platform()), clock, {});
  for (const Run::Place& place : records.places) decoding.take(records.at(place));
  decoding.finish();
}

void copy(const Run& records) {
  Bytes room(records.bytes.size());
  for (const Run::Place& place : records.places) {
    std::memcpy(room.data() + place.begin, records.bytes.data() + place.begin, place.size);
    benchmark::ClobberMemory();
  }
}

void read(const Run& propertyLists, const PlistSerialiser& plists) {
  PlistValue value;
  for (const Run::Place& place : propertyLists.places) plists.parseOver(value, propertyLists.at(place).bytes);
}

}  // namespace

bool measureDrive(const std::string& technology, const std::string& capture) {
  Surroundings surroundings;
  const auto id = technologyId(technology);
  const auto reader = openCapture(capture, surroundings.plists);
  const Drive drive = readDrive(*reader);
  if (!id || reader->fault()) return false;
  std::printf(
      R"({"records": %zu, "record_bytes": %zu, "lists": %zu, "list_bytes": %zu, "decode": %.6f, "copy": %.6f, "read": %.6f})"
      "\n",
      drive.records.places.size(), drive.records.bytes.size(), drive.propertyLists.places.size(),
      drive.propertyLists.bytes.size(), seconds([&] { decode(drive.records, *id, surroundings); }),
      seconds([&] { copy(drive.records); }),
      seconds([&] { read(drive.propertyLists, surroundings.plists); }));
  return true;
}

}  // namespace kelvasi::bench
