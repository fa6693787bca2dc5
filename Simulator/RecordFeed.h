// SPDX-License-Identifier: Apache-2.0
// Sends the records of a world when they have news, and now and then when they have none.
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "Platform/PlistSerialiser.h"
#include "Simulator/Message.h"
#include "Simulator/RecordStamp.h"

namespace kelvasi::sim {

template <typename World>
struct RecordRule {
  // The record of the world as it is; nothing while there is none to send.
  std::optional<Bytes> (*encode)(const World& world, const PlistSerialiser& plists);
  std::chrono::milliseconds atMostEvery{0};       // a measurement that always changes
  std::chrono::milliseconds atLeastEvery{10000};  // repeated although nothing changed
  bool followsTheOneBefore = false;               // sent as well whenever the record before it is
};

// An encoder that needs no property lists, as a rule takes it.
template <auto encode, typename World>
std::optional<Bytes> recordOf(const World& world, const PlistSerialiser&) {
  return encode(world);
}

template <typename World>
class RecordFeed {
 public:
  // `rules` outlive the feed. Records of one moment are sent in their order.
  RecordFeed(std::span<const RecordRule<World>> rules, const PlistSerialiser& plists)
      : rules_(rules), plists_(plists), sent_(rules.size()) {}

  // `isTurningPoint`: something has changed that several records tell of, so none may be late. A record is
  // due at once when there was none before.
  void advance(WorldTime now, const World& world, bool isTurningPoint, Messages& messages) {
    bool wasSent = false;
    for (std::size_t place = 0; place < rules_.size(); ++place) {
      const bool mustFollow = wasSent && rules_[place].followsTheOneBefore;
      wasSent = send(place, {now, isTurningPoint, mustFollow}, world, messages);
    }
  }

  // Every record that there is to send.
  void all(WorldTime now, const World& world, Messages& messages) const {
    for (const auto& rule : rules_) {
      if (auto record = rule.encode(world, plists_)) append(std::move(*record), now, messages);
    }
  }

 private:
  struct Moment {
    WorldTime now;
    bool isTurningPoint;
    bool mustFollow;
  };

  bool send(std::size_t place, const Moment& moment, const World& world, Messages& messages) {
    const auto since = moment.now - sent_[place].at;
    const bool isEarly = sent_[place].record && since < rules_[place].atMostEvery;
    if (isEarly && !moment.isTurningPoint && !moment.mustFollow) return false;
    auto record = rules_[place].encode(world, plists_);
    const bool isOldNews = record == sent_[place].record && since < rules_[place].atLeastEvery;
    if (isOldNews && !moment.mustFollow) return false;
    sent_[place] = {record, moment.now};
    if (!record) return false;
    append(std::move(*record), moment.now, messages);
    return true;
  }

  static void append(Bytes record, WorldTime now, Messages& messages) {
    stampRecord(record, now);
    messages.push_back(logMessage(std::move(record)));
  }

  struct Sent {
    std::optional<Bytes> record;
    WorldTime at{0};
  };

  std::span<const RecordRule<World>> rules_;
  const PlistSerialiser& plists_;
  std::vector<Sent> sent_;
};

}  // namespace kelvasi::sim
