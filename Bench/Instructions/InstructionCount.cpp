// SPDX-License-Identifier: Apache-2.0
#include "Bench/Instructions/InstructionCount.h"

#include <valgrind/callgrind.h>

#include <functional>
#include <string>

#include "Bench/LogGenerator/Decoding.h"
#include "Bench/LogGenerator/Samples.h"
#include "Bench/Simulator/Drive.h"
#include "Model/KelvasiModelNode.h"

namespace kelvasi::bench {

namespace {

constexpr std::size_t ticks = 32;
constexpr std::size_t messagesOfDrive = 1024;
constexpr std::size_t documents = 64;

// Once before it counts: rows exist, memory is there.
void count(const std::string& name, std::size_t items, const std::function<void()>& work) {
  const std::string trigger = name + " (" + std::to_string(items) + ")";
  work();
  CALLGRIND_ZERO_STATS;
  CALLGRIND_TOGGLE_COLLECT;
  work();
  CALLGRIND_TOGGLE_COLLECT;
  CALLGRIND_DUMP_STATS_AT(trigger.c_str());
}

void countRecords(const Technology& technology) {
  for (const Sample& sample : technology.samples) {
    const Messages messages = recordsOf(sample);
    Decoding decoding(technology.id);
    count(std::string(technology.name) + " " + std::string(sample.name), messages.size(),
          [&] { decoding.take(messages); });
  }
}

void countDrive(const Technology& technology) {
  const Messages messages = driveOf(technology, messagesOfDrive);
  Decoding decoding(technology.id);
  count(nameOfDrive(technology, messages), messages.size(), [&] { decoding.take(messages); });
  const std::string name(technology.name);
  count(name + " tick", ticks, [&] {
    for (std::size_t tick = 0; tick < ticks; ++tick) decoding.tick();
  });
  count(name + " tree of a display", ticks, [&] {
    for (std::size_t tick = 0; tick < ticks; ++tick) {
      PathDictionary nodesByPath;
      KelvasiModelNode::makeTreeFromObject(decoding.tick(), nodesByPath);
    }
  });
}

// Documents of some 3 KB.
struct Document {
  const char* name;
  PlistValue (*make)(Random& random);
};

PlistValue cellListOf(Random& random) {
  const auto list = PlistArray::make();
  while (list->size() < 8) {
    list->append(PlistDictionary::make({
        {"kTelvonCellMonitorCellRadioAccessTechnology", "kTelvonCellMonitorRadioAccessTechnologyLTE"},
        {"kTelvonCellMonitorCellType", "kTelvonCellMonitorCellTypeNeighbor"},
        {"kTelvonCellMonitorUARFCN", random.below(40000)},
        {"kTelvonCellMonitorPID", random.below(504)},
        {"kTelvonCellMonitorBandInfo", random.below(44)},
    }));
  }
  return list;
}

PlistValue objectsOf(Random& random) {
  const auto cells = PlistArray::make();
  while (cells->size() < 20) {
    cells->append(PlistDictionary::make({
        {"ARFCN", std::to_string(random.below(1024))},
        {"BSIC", std::to_string(random.below(64))},
        {"Received Level", "-" + std::to_string(random.below(110)) + " dBm"},
    }));
  }
  return PlistDictionary::make({{"Neighbor Cells", PlistDictionary::make({{"GSM", cells}})}});
}

constexpr Document documentKinds[] = {{"cell list", cellListOf}, {"object stream", objectsOf}};

void countPropertyList(const Document& kind) {
  const LibplistSerialiser plists;
  Random random;
  Messages texts;
  while (texts.size() < documents) texts.push_back(plists.serialiseXml(kind.make(random)).value());
  const std::string size = std::to_string(texts.front().size());
  count("property list, " + std::string(kind.name) + " of " + size + " bytes", documents, [&] {
    for (const Bytes& text : texts) plists.parse(text);
  });
}

}  // namespace

void countInstructions() {
  for (const Document& kind : documentKinds) countPropertyList(kind);
  for (const Technology& technology : technologies()) {
    countRecords(technology);
    countDrive(technology);
  }
}

}  // namespace kelvasi::bench
