// SPDX-License-Identifier: Apache-2.0
// Once the rows that a record fills exist, it costs no allocation, its readings included: every record of a
// drive, by its log code.
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <limits>
#include <map>

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Readings.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Simulator/ScenarioList.h"
#include "Simulator/Subscription.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/C2K/Required.h"
#include "Tests/LogGenerator/Sections/ClassIndexes.h"
#include "Tests/Support/AllocationCounter.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::sim {
namespace {

constexpr int steps = 9000;

struct DeafLog : SystemLog {
  bool wants(LogPriority) const override { return false; }
  void write(LogPriority, std::string_view) override {}
};

// At work as the viewer has it, with the templates that are installed.
class Generator {
 public:
  explicit Generator(std::string_view technology) {
    for (const std::string name : {"Orvane_GSM.plist", "LTE.plist", "UTRAN.plist", "C2KTemplate.plist"}) {
      std::ifstream file(KELVASI_RESOURCES_DIRECTORY "/" + name, std::ios::binary);
      surroundings_.resources.files[name] = Bytes(std::istreambuf_iterator<char>(file), {});
    }
    generator_ = LogGenerator::generatorFromTechnology(
        technology, {log_, surroundings_.trace, plists_, surroundings_.resources, surroundings_.clock});
    generator_->generateLogUsingState(*state_);
    generator_->gatherInto(&readings_);
  }

  void take(const Messages& messages) {
    for (const Message& message : messages) generator_->updateState(*state_, message.bytes);
  }

 private:
  DeafLog log_;
  kelvasi::test::TestPlatform surroundings_;
  LibplistSerialiser plists_;
  Readings readings_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
};

// Without those of the telephony daemon, which hold property lists.
std::map<LogCode, Messages> recordsOfADrive(std::string_view technology) {
  const LibplistSerialiser plists;
  const auto scenario = findScenario(technology, "drive")->make(1, plists);
  std::map<LogCode, Messages> records;
  for (int step = 0; step < steps; ++step) {
    Messages messages;
    scenario->step(messages);
    for (Message& message : messages) {
      if (*message.logCode < extraLogCodes) records[*message.logCode].push_back(std::move(message));
    }
  }
  return records;
}

std::size_t allocationsOf(const Messages& messages, Generator& generator) {
  for (int round = 0; round < 2; ++round) generator.take(messages);
  // The buffer of raw messages doubles now and then, though not in every round.
  std::size_t least = std::numeric_limits<std::size_t>::max();
  for (int round = 0; round < 3; ++round)
    least = std::min(least, kelvasi::test::allocationsDuring([&] { generator.take(messages); }));
  return least;
}

// What a drive has to hold, without the codes of the telephony daemon.
template <typename Index>
std::vector<LogCode> recordsOf() {
  std::vector<LogCode> codes = kelvasi::test::requiredCodes<Index>();
  std::erase_if(codes, [](LogCode code) { return code >= extraLogCodes; });
  return codes;
}
std::vector<LogCode> cdmaRecords() {
  std::vector<LogCode> codes;
  for (const auto& each : kelvasi::test::requiredC2KRecords) codes.push_back(each.logCode);
  return codes;
}

std::vector<LogCode> requiredRecords(std::string_view technology) {
  if (technology == kTelvonLogChannelTechnology_Orvane_GSM) return recordsOf<Orvane_GSMClassIndex>();
  if (technology == kTelvonLogChannelTechnology_Orvane_LTE) return recordsOf<LTEClassIndex>();
  if (technology == kTelvonLogChannelTechnology_Orvane_UTRAN2) return recordsOf<UTRANClassIndex>();
  return cdmaRecords();
}

class EveryRecord : public testing::TestWithParam<std::string_view> {};

TEST_P(EveryRecord, CostsNoAllocationOnceTheRowsExist) {
  const auto records = recordsOfADrive(GetParam());
  for (const LogCode code : requiredRecords(GetParam()))
    EXPECT_EQ(records.count(code), 1u) << std::hex << code;
  for (const auto& [logCode, messages] : records) {
    Generator generator(GetParam());
    EXPECT_EQ(allocationsOf(messages, generator), 0u)
        << "in " << messages.size() << " records 0x" << std::hex << logCode;
  }
}

INSTANTIATE_TEST_SUITE_P(Drives, EveryRecord,
                         testing::Values(kTelvonLogChannelTechnology_Orvane_GSM,
                                         kTelvonLogChannelTechnology_Orvane_CDMA,
                                         kTelvonLogChannelTechnology_Orvane_LTE,
                                         kTelvonLogChannelTechnology_Orvane_UTRAN2),
                         [](const auto& each) { return std::string(each.param); });

}  // namespace
}  // namespace kelvasi::sim
