// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/Traffic.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace kelvasi::sim::gsm {

namespace {

constexpr std::uint8_t processes = 6;
constexpr double harqErrorRate = 0.1;  // what link adaptation aims at
constexpr double leastLoad = 0.4;      // share of the sub-frames that the handset is scheduled in

// Transport blocks of 3GPP TS 25.214, table 7A: bits by quality, from poor to good.
constexpr std::array<std::uint32_t, 10> blockBits{317, 461, 931, 1483, 2279, 3319, 4664, 5887, 7168, 9719};
constexpr double poorestEcNo = -16;
constexpr double ecNoStep = 1.2;

constexpr std::uint8_t signallingChannel = 24;
constexpr std::uint8_t commonChannel = 31;
constexpr std::array<std::uint8_t, 3> speechChannels{1, 2, 3};  // the three classes of speech bits
constexpr std::uint32_t speechBlocks = 50;                      // a second
constexpr std::uint32_t signallingBlocks = 25;
constexpr std::uint32_t commonBlocks = 100;

std::uint32_t bitsAt(double ecNo) {
  const double place = std::clamp((ecNo - poorestEcNo) / ecNoStep, 0.0, blockBits.size() - 1.0);
  return blockBits[static_cast<std::size_t>(place)];
}

// About 1 % on average, more the poorer the cell.
double blockErrorRate(double ecNo) {
  return std::clamp(0.01 * std::pow(10, (-10 - ecNo) / 5), 0.0005, 0.3);
}

bool isSameKind(Use one, const Use& other) {
  one.ecNo = other.ecNo;
  return one == other;
}

}  // namespace

void Traffic::pass(const Use& use, double seconds) {
  left_ -= seconds;
  const bool mustReport = left_ <= 0 || !isSameKind(use, use_);
  use_ = use;
  if (!mustReport) return;
  left_ = period;
  report(use);
}

void Traffic::report(const Use& use) {
  primary_.clear();
  secondary_.clear();
  channels_.clear();
  if (use.hasHsdpa) primary_ = carrierReport(use.ecNo);
  if (use.hasHsdpa && use.hasTwoCarriers) secondary_ = carrierReport(use.ecNo - 1);
  const double errorRate = blockErrorRate(use.ecNo);
  if (use.hasSpeech) {
    for (const std::uint8_t id : speechChannels) addChannel(id, speechBlocks, errorRate);
  }
  if (use.hasDch) addChannel(signallingChannel, signallingBlocks, errorRate);
  if (use.hasFach) addChannel(commonChannel, commonBlocks, errorRate);
}

std::vector<HarqProcess> Traffic::carrierReport(double ecNo) {
  std::vector<HarqProcess> report;
  const std::uint32_t bits = bitsAt(ecNo);
  for (std::uint8_t id = 0; id < processes; ++id) {
    const auto blocks = static_cast<std::uint32_t>(random_.between(leastLoad, 1) * subFrames / processes);
    const std::uint32_t errors = errorsAmong(blocks, harqErrorRate);
    report.push_back({.id = id,
                      .bitsReceived = (blocks - errors) * bits,
                      .newTransmissions = static_cast<std::uint16_t>(blocks),
                      .blockErrors = static_cast<std::uint16_t>(errors)});
  }
  return report;
}

void Traffic::addChannel(std::uint8_t id, std::uint32_t blocks, double errorRate) {
  channels_.push_back({.id = id, .received = blocks, .inError = errorsAmong(blocks, errorRate)});
}

std::uint32_t Traffic::errorsAmong(std::uint32_t blocks, double rate) {
  std::uint32_t errors = 0;
  for (std::uint32_t block = 0; block < blocks; ++block) errors += random_.happens(rate) ? 1 : 0;
  return errors;
}

}  // namespace kelvasi::sim::gsm
