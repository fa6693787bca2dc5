// SPDX-License-Identifier: Apache-2.0
// Plays a scenario step by step, and what every scenario is asked.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

#include "Simulator/Scenario.h"
#include "Simulator/Subscription.h"
#include "Tests/Simulator/DecodingViewer.h"

namespace kelvasi::sim::test {

inline bool has(const Messages& messages, LogCode code) {
  return std::ranges::any_of(messages, [code](const Message& message) { return message.logCode == code; });
}

// Looks at the messages of each step, up to the first failure.
template <typename Look>
void play(Scenario& scenario, int steps, Look look) {
  for (int turn = 0; turn < steps && !testing::Test::HasFailure(); ++turn) {
    Messages messages;
    scenario.step(messages);
    SCOPED_TRACE("step " + std::to_string(turn));
    look(messages);
  }
}

// Every one of these codes, and none that the generator does not subscribe to.
inline void expectEveryCode(Scenario& scenario, int steps, const LogGenerator& generator,
                            const std::vector<LogCode>& codes) {
  const PlistValue command = generator.getStartCommand();
  const auto wanted = Subscription::fromStartCommand(*command.dictionary());
  std::set<LogCode> seen;
  play(scenario, steps, [&](const Messages& messages) {
    for (const Message& message : messages) {
      ASSERT_TRUE(wanted.wants(message));
      seen.insert(*message.logCode);
    }
  });
  EXPECT_THAT(seen, testing::IsSupersetOf(codes));
}

template <typename Kind>
Bytes bytesOfAThousandSteps(std::uint64_t seed) {
  const LibplistSerialiser plists;
  Kind scenario(seed, plists);
  Messages messages;
  for (int turn = 0; turn < 1000; ++turn) scenario.step(messages);
  Bytes all;
  for (const Message& message : messages) all.insert(all.end(), message.bytes.begin(), message.bytes.end());
  return all;
}

template <typename Kind>
void expectTheSeedToDecide() {
  EXPECT_EQ(bytesOfAThousandSteps<Kind>(1), bytesOfAThousandSteps<Kind>(1));
  EXPECT_NE(bytesOfAThousandSteps<Kind>(1), bytesOfAThousandSteps<Kind>(2));
}

// What one of two ways of telling is told alone: the baseband's records, and the telephony daemon's own.
struct ViewerOfEachWay {
  template <typename Make>
  explicit ViewerOfEachWay(Make make) : baseband(make()), daemon(make()) {}

  void take(const Messages& messages) {
    Messages ofBaseband;
    Messages ofDaemon;
    for (const Message& message : messages)
      (*message.logCode >= extraLogCodes ? ofDaemon : ofBaseband).push_back(message);
    baseband.take(ofBaseband);
    daemon.take(ofDaemon);
  }

  DecodingViewer baseband;
  DecodingViewer daemon;
};

}  // namespace kelvasi::sim::test
