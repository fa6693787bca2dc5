// SPDX-License-Identifier: Apache-2.0
// What the UMTS transport channels carried in the last reporting period: HSDPA and block errors.
#pragma once

#include <cstdint>
#include <vector>

#include "Simulator/Random.h"

namespace kelvasi::sim::gsm {

struct HarqProcess {
  std::uint8_t id = 0;
  std::uint32_t bitsReceived = 0;
  std::uint16_t newTransmissions = 0;
  std::uint16_t blockErrors = 0;
};

struct TransportChannel {
  std::uint8_t id = 0;
  std::uint32_t received = 0;
  std::uint32_t inError = 0;
};

// What the connection is used for, as far as the transport channels are concerned.
struct Use {
  bool hasDch = false;
  bool hasFach = false;
  bool hasSpeech = false;
  bool hasHsdpa = false;
  bool hasTwoCarriers = false;
  double ecNo = 0;  // dB, of the serving cell
  bool operator==(const Use&) const = default;
};

class Traffic {
 public:
  static constexpr double period = 1;               // seconds
  static constexpr std::uint16_t subFrames = 500;   // of 2 ms
  static constexpr std::uint16_t windowSize = 100;  // blocks

  explicit Traffic(Random random) : random_(random) {}

  // Makes a report at the end of each period, and at once when the use changes in kind.
  void pass(const Use& use, double seconds);

  // Empty while there is no HSDPA; the secondary carrier's while there is none.
  const std::vector<HarqProcess>& primary() const { return primary_; }
  const std::vector<HarqProcess>& secondary() const { return secondary_; }
  // Empty while there is no transport channel.
  const std::vector<TransportChannel>& channels() const { return channels_; }

 private:
  void report(const Use& use);
  std::vector<HarqProcess> carrierReport(double ecNo);
  void addChannel(std::uint8_t id, std::uint32_t blocks, double errorRate);
  std::uint32_t errorsAmong(std::uint32_t blocks, double rate);

  Random random_;
  Use use_;
  double left_ = 0;
  std::vector<HarqProcess> primary_;
  std::vector<HarqProcess> secondary_;
  std::vector<TransportChannel> channels_;
};

}  // namespace kelvasi::sim::gsm
