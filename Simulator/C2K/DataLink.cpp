// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/DataLink.h"

#include <algorithm>
#include <cmath>

namespace kelvasi::sim::c2k {

namespace {

// The largest packet of each data-rate value that a handset asks for, for one user at a time.
struct ForwardFormat {
  double needed;  // dB of carrier to interference, about
  int slots;
  std::size_t counter;
  constexpr std::int64_t bits() const { return evdoForwardRate::weights.at(counter); }
};
constexpr std::array forwardFormats{
    ForwardFormat{-12.5, 16, 8}, ForwardFormat{-9.5, 8, 13}, ForwardFormat{-6.5, 4, 18},
    ForwardFormat{-4, 2, 23},    ForwardFormat{-1, 1, 32},   ForwardFormat{1.3, 2, 39},
    ForwardFormat{3, 1, 43},     ForwardFormat{7.2, 1, 48},  ForwardFormat{9.5, 1, 50},
};
constexpr const auto& payloads = evdoReverseRate::weights;

constexpr double slotsPerSecond = 600;
constexpr double subFramesPerSecond = 50;  // of each interlace
constexpr double headroomPerRate = 3;      // dB
constexpr double leastShare = 0.25;        // of the sector's slots that are this handset's
constexpr double mostShare = 0.8;
constexpr std::uint32_t fewestBefore = 100000;  // packets of a format from before
constexpr std::uint32_t mostBefore = 1000000;

std::uint32_t before(Random& random) {
  return fewestBefore + random.below(mostBefore - fewestBefore);
}

}  // namespace

DataLink::DataLink(Random random) : random_(random) {
  for (const ForwardFormat& format : forwardFormats) {
    const std::uint32_t packets = before(random_);
    forwardNow_.counters[format.counter] = packets;
    forwardNow_.bits += packets * format.bits();
  }
  for (std::size_t rate = 0; rate < payloads.size(); ++rate) {
    const std::size_t interlace = random_.below(evdoReverseRate::subFrames);
    countReverse(interlace, rate, 0, before(random_));
  }
  forward_ = forwardNow_;
  reverse_ = reverseNow_;
}

void DataLink::pass(bool isTransferring, double carrierToInterference, double headroom, double seconds) {
  if (isTransferring) {
    receive(carrierToInterference, seconds);
    transmit(headroom, seconds);
  }
  inSecond_ += seconds;
  if (inSecond_ < 1 - seconds / 2) return;
  inSecond_ = 0;
  const bool isQuiet = forwardNow_.bits == forward_.bits && reverseNow_.bits == reverse_.bits;
  quietReports_ = isQuiet ? quietReports_ + 1 : 0;
  ++forwardNow_.sequence;
  ++reverseNow_.sequence;
  forward_ = forwardNow_;
  reverse_ = reverseNow_;
}

void DataLink::receive(double carrierToInterference, double seconds) {
  const ForwardFormat* best = &forwardFormats.front();
  for (const ForwardFormat& format : forwardFormats) {
    if (carrierToInterference >= format.needed) best = &format;
  }
  const double slots = slotsPerSecond * seconds * random_.between(leastShare, mostShare);
  const auto packets = static_cast<std::uint32_t>(std::ceil(slots / best->slots));
  forwardNow_.counters[best->counter] += packets;
  forwardNow_.bits += packets * best->bits();
}

void DataLink::transmit(double headroom, double seconds) {
  const auto most = static_cast<int>(payloads.size()) - 1;
  for (std::size_t interlace = 0; interlace < evdoReverseRate::subFrames; ++interlace) {
    const int rate = std::clamp(static_cast<int>(headroom / headroomPerRate) + random_.among(-1, 1), 0, most);
    const std::size_t end = 1 + random_.below(evdoReverseRate::counters - 1);
    const double packets = subFramesPerSecond * seconds / static_cast<double>(end + 1);
    countReverse(interlace, static_cast<std::size_t>(rate), end,
                 static_cast<std::uint32_t>(std::ceil(packets)));
  }
}

void DataLink::countReverse(std::size_t interlace, std::size_t rate, std::size_t end, std::uint32_t packets) {
  const std::size_t mode = random_.below(evdoReverseRate::halves);
  reverseNow_.counters[interlace][mode][rate][end] += packets;
  reverseNow_.bits += packets * payloads[rate];
}

}  // namespace kelvasi::sim::c2k
