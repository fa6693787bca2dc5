#include "Simulator/Handset/CellSelection.h"

namespace kelvasi::sim::gsm {

namespace {

// GSM
constexpr double leastAccessLevel = -104;  // dBm, RXLEV_ACCESS_MIN
constexpr double reselectOffset = 2;       // dB, CELL_RESELECT_OFFSET
constexpr double reselectHysteresis = 4;   // dB
constexpr double handoverMargin = 5;       // dB
constexpr double comfortableC1 = 8;        // dB
// UMTS
constexpr double leastRscp = -108;  // dBm
constexpr double leastEcNo = -17;   // dB
constexpr double poorRscp = -104;
constexpr double poorEcNo = -14;
constexpr double goodRscp = -99;
constexpr double goodEcNo = -11;
constexpr double rankMargin = 3;  // dB
// Seconds
constexpr double selectionTime = 0.6;
constexpr double lossTime = 2;
constexpr double umtsReselectionTime = 1;
constexpr double gsmReselectionTime = 5;
constexpr double handoverTime = 1.5;
constexpr double technologyTime = 3;

double rank(const Cell& cell, const Reception& reception) {
  return cell.technology == Technology::gsm ? criterionC2(reception) : reception.ecNo;
}

}  // namespace

double criterionC1(const Reception& reception) {
  return reception.level - leastAccessLevel;
}

double criterionC2(const Reception& reception) {
  return criterionC1(reception) + reselectOffset;
}

bool isSuitable(const Cell& cell, const Reception& reception) {
  if (cell.technology == Technology::gsm) return criterionC1(reception) > 0;
  return reception.level > leastRscp && reception.ecNo > leastEcNo;
}

void CellSelection::look(const std::vector<Reception>& receptions, bool isConnected, double seconds) {
  const auto change = wanted(receptions, isConnected);
  const bool isSame = change && pending_ && change->to == pending_->to;
  pendingFor_ = isSame ? pendingFor_ + seconds : 0;
  pending_ = change;
  if (!change || pendingFor_ < change->patience) return;
  serving_ = change->to;
  pending_.reset();
}

std::optional<CellSelection::Change> CellSelection::wanted(const std::vector<Reception>& receptions,
                                                           bool isConnected) const {
  if (!serving_) {
    const auto found = bestOfAll(receptions);
    return found ? std::optional(Change{found, selectionTime}) : std::nullopt;
  }
  if (!isSuitable(cells_[*serving_], receptions[*serving_])) return Change{bestOfAll(receptions), lossTime};
  return cells_[*serving_].technology == Technology::umts ? fromUmts(receptions, isConnected)
                                                          : fromGsm(receptions, isConnected);
}

std::optional<CellSelection::Change> CellSelection::fromUmts(const std::vector<Reception>& receptions,
                                                             bool isConnected) const {
  const Reception& serving = receptions[*serving_];
  const auto umts = best(receptions, Technology::umts);
  if (umts && receptions[*umts].ecNo > serving.ecNo + rankMargin)
    return Change{umts, isConnected ? 0 : umtsReselectionTime};
  const auto gsm = best(receptions, Technology::gsm);
  const bool isPoor = serving.level < poorRscp || serving.ecNo < poorEcNo;
  if (isPoor && gsm && criterionC1(receptions[*gsm]) > comfortableC1) return Change{gsm, technologyTime};
  return std::nullopt;
}

std::optional<CellSelection::Change> CellSelection::fromGsm(const std::vector<Reception>& receptions,
                                                            bool isConnected) const {
  const Reception& serving = receptions[*serving_];
  const auto umts = best(receptions, Technology::umts);
  if (!isConnected && umts && receptions[*umts].level > goodRscp && receptions[*umts].ecNo > goodEcNo)
    return Change{umts, technologyTime};
  const auto gsm = best(receptions, Technology::gsm);
  const double margin = isConnected ? handoverMargin : reselectHysteresis;
  if (gsm && criterionC2(receptions[*gsm]) > criterionC2(serving) + margin)
    return Change{gsm, isConnected ? handoverTime : gsmReselectionTime};
  return std::nullopt;
}

// Of the suitable ones.
std::optional<std::size_t> CellSelection::best(const std::vector<Reception>& receptions,
                                               Technology technology) const {
  std::optional<std::size_t> found;
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    if (cells_[cell].technology != technology || !isSuitable(cells_[cell], receptions[cell])) continue;
    if (!found || rank(cells_[cell], receptions[cell]) > rank(cells_[*found], receptions[*found]))
      found = cell;
  }
  return found;
}

std::optional<std::size_t> CellSelection::bestOfAll(const std::vector<Reception>& receptions) const {
  const auto umts = best(receptions, Technology::umts);
  return umts ? umts : best(receptions, Technology::gsm);
}

}  // namespace kelvasi::sim::gsm
