// SPDX-License-Identifier: Apache-2.0
// What EV-DO carries: packets counted by their transmission format (3GPP2 C.S0024-A), as the records of both
// rates tell them once a second.
#pragma once

#include <array>
#include <cstdint>

#include "LogGenerator/C2K/EvdoRates.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

class DataLink {
 public:
  using ForwardCounters = std::array<std::uint32_t, evdoForwardRate::weights.size()>;
  // By interlace, transmission mode, payload, and the sub-packet that ended it.
  using ReverseCounters =
      std::array<std::array<std::array<std::array<std::uint32_t, evdoReverseRate::counters>,
                                       evdoReverseRate::weights.size()>,
                            evdoReverseRate::halves>,
                 evdoReverseRate::subFrames>;

  template <typename Counters>
  struct Report {
    std::uint32_t sequence = 0;  // seconds
    Counters counters{};
    std::int64_t bits = 0;  // of all packets since the counters were zero
  };

  // A handset that has been in use for a while.
  explicit DataLink(Random random);

  // `carrierToInterference` of the serving pilot and `headroom` of the transmitter, both dB, are read while
  // data are transferred.
  void pass(bool isTransferring, double carrierToInterference, double headroom, double seconds);

  // As of the last whole second.
  const Report<ForwardCounters>& forward() const { return forward_; }
  const Report<ReverseCounters>& reverse() const { return reverse_; }
  // Whether the records of both rates have told that no packets are carried any more.
  bool hasToldItsEnd() const { return quietReports_ > 1; }

 private:
  void receive(double carrierToInterference, double seconds);
  void transmit(double headroom, double seconds);
  void countReverse(std::size_t interlace, std::size_t rate, std::size_t end, std::uint32_t packets);

  Random random_;
  Report<ForwardCounters> forward_;
  Report<ReverseCounters> reverse_;
  Report<ForwardCounters> forwardNow_;
  Report<ReverseCounters> reverseNow_;
  double inSecond_ = 0;
  int quietReports_ = 2;  // in a row, without new packets
};

}  // namespace kelvasi::sim::c2k
