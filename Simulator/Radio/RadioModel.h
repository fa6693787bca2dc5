// SPDX-License-Identifier: Apache-2.0
// What a handset receives of every cell where it is: path loss, shadowing, interference, and places into
// which the radio hardly reaches.
#pragma once

#include <array>
#include <span>
#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim {

struct Reception {
  // dBm, filtered: received level of a GSM cell, RSCP in UMTS, RSRP in LTE, the pilot's level in CDMA.
  double level = -200;
  double ecNo = -40;  // dB, in UMTS; RSRQ in LTE; Ec/Io in CDMA
};

// A round place with additional loss. Where several overlap, the deepest counts.
struct Shadow {
  Point middle;
  double radius = 0;
  std::array<double, technologyCount> loss{};  // dB, in the order of the technologies
};

class RadioModel {
 public:
  // The cells outlive the model.
  RadioModel(std::span<const Cell> cells, std::vector<Shadow> shadows, Random random);

  // Receives at `at`, `seconds` after the last time.
  void receive(Point at, double seconds);

  // By the places of the cells.
  const std::vector<Reception>& receptions() const { return receptions_; }
  // All that is received in a carrier that cells share, dBm: of UMTS and CDMA, or of one resource block in
  // LTE.
  double carrierPower(Technology technology, std::uint16_t frequency) const;

 private:
  struct Carrier {
    Technology technology;
    std::uint16_t frequency;
    std::vector<std::size_t> cells;
    double power = -200;  // dBm
  };

  void addToCarrier(std::size_t cell);
  void receiveCarrier(Carrier& carrier);
  void moveShadowing(double metres);
  double levelOf(std::size_t cell, Point at) const;

  std::span<const Cell> cells_;
  std::vector<Shadow> shadows_;
  Random random_;
  std::vector<double> shadowing_;  // dB, by cell
  std::vector<Reception> receptions_;
  std::vector<Carrier> carriers_;
  Point last_;
  bool isFirst_ = true;
};

}  // namespace kelvasi::sim
