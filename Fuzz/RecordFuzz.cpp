// SPDX-License-Identifier: Apache-2.0
// Whatever records come and in whatever order, no decoder of any technology breaks. The first byte says which
// technology; then come records: which of the codes that it asks for, how long the payload is, the payload.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string_view>
#include <vector>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"
#include "Telvon/TechnologyName.h"

namespace {

using namespace kelvasi;

// Every line is made, and none is kept.
struct DeafLog : SystemLog {
  bool wants(LogPriority) const override { return true; }
  void write(LogPriority, std::string_view) override {}
};
struct DeafTrace : TraceOutput {
  void writeLine(std::string_view) override {}
};

void addCodes(const PlistDictionary& command, const char* key, LogCode first, std::vector<LogCode>& codes) {
  const PlistValue list = command.get(key);
  if (!list.array()) return;
  for (const PlistValue& code : *list.array()) codes.push_back(first + static_cast<LogCode>(*code.integer()));
}

std::vector<LogCode> codesOf(const LogGenerator& generator) {
  std::vector<LogCode> codes;
  const PlistValue command = generator.getStartCommand();
  addCodes(*command.dictionary(), "SetOrvaneLogCodes", 0, codes);
  addCodes(*command.dictionary(), "SetTelvonExtraCodes", extraLogCodes, codes);
  return codes;
}

Bytes message(LogCode code, std::span<const std::uint8_t> payload) {
  Bytes bytes(13);
  bytes[0] = code >= extraLogCodes ? 0xFF : 1;
  bytes[3] = static_cast<std::uint8_t>(code);
  bytes[4] = static_cast<std::uint8_t>(code >> 8);
  bytes.insert(bytes.end(), payload.begin(), payload.end());
  return bytes;
}

// What a daemon must not send ends the process on purpose.
void take(LogGenerator& generator, PlistDictionary& state, std::span<const std::uint8_t> bytes) {
  try {
    generator.updateState(state, bytes);
  } catch (const LogCode_0xFF000020::UnknownDataException&) {
  } catch (const AssertionFailure&) {
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  DeafLog log;
  DeafTrace trace;
  const LibplistSerialiser plists;
  const PackageResources resources(KELVASI_RESOURCES_DIRECTORY);
  const PosixClock clock;
  std::span<const std::uint8_t> input(data, size);
  if (input.empty()) return 0;
  const auto technologies = technologyIds();
  const auto generator = LogGenerator::generatorFromTechnology(technologies[input[0] % technologies.size()],
                                                               {log, trace, plists, resources, clock});
  const std::vector<LogCode> codes = codesOf(*generator);
  PlistDictionary state;
  input = input.subspan(1);
  if (codes.empty()) take(*generator, state, input);
  while (!codes.empty() && input.size() >= 2) {
    const LogCode code = codes[input[0] % codes.size()];
    const std::size_t length = std::min<std::size_t>(input[1], input.size() - 2);
    take(*generator, state, message(code, input.subspan(2, length)));
    input = input.subspan(2 + length);
  }
  generator->generateLogUsingState(state);
  return 0;
}
