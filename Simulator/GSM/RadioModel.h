// What a handset receives of every cell where it is: path loss, shadowing, interference, and places into
// which the radio hardly reaches.
#pragma once

#include <span>
#include <vector>

#include "Simulator/GSM/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::gsm {

struct Reception {
  double level = -200;  // dBm, filtered: received level of a GSM cell, RSCP of a UMTS cell
  double ecNo = -40;    // dB, of a UMTS cell
};

// A round place with additional loss, dB.
struct Shadow {
  Point middle;
  double radius = 0;
  double gsmLoss = 0;
  double umtsLoss = 0;
};

class RadioModel {
 public:
  // The cells outlive the model.
  RadioModel(std::span<const Cell> cells, std::vector<Shadow> shadows, Random random);

  // Receives at `at`, `seconds` after the last time.
  void receive(Point at, double seconds);

  // By the places of the cells.
  const std::vector<Reception>& receptions() const { return receptions_; }
  // All that is received in the UMTS carrier, dBm.
  double carrierPower() const { return carrierPower_; }

 private:
  void moveShadowing(double metres);
  double levelOf(std::size_t cell, Point at) const;

  std::span<const Cell> cells_;
  std::vector<Shadow> shadows_;
  Random random_;
  std::vector<double> shadowing_;  // dB, by cell
  std::vector<Reception> receptions_;
  double carrierPower_ = -100;
  Point last_;
  bool isFirst_ = true;
};

}  // namespace kelvasi::sim::gsm
