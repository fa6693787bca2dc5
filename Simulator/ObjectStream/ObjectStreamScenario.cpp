// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ObjectStream/ObjectStreamScenario.h"

#include <stdexcept>
#include <utility>

#include "Simulator/ObjectStream/HandsetObject.h"

namespace kelvasi::sim::objectStream {

namespace {
// The world moves in shorter steps than it is told of.
constexpr int movesPerStep = 5;
}  // namespace

void ObjectStreamScenario::step(Messages& messages) {
  const double seconds = std::chrono::duration<double>(stepLength()).count();
  for (int move = 0; move < movesPerStep; ++move) world_.pass(seconds / movesPerStep);
  greet(messages);
}

void ObjectStreamScenario::greet(Messages& messages) {
  const PlistValue object = handsetObject(world_);
  const bool isBinary = std::exchange(isBinaryNext_, !isBinaryNext_);
  auto bytes = isBinary ? plists_.serialiseBinary(object) : plists_.serialiseXml(object);
  if (!bytes) throw std::logic_error("The handset's object cannot be serialised");
  messages.push_back({.bytes = std::move(*bytes), .logCode = std::nullopt});
}

}  // namespace kelvasi::sim::objectStream
