// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/CellSelection.h"

#include <algorithm>

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

bool isPoor(const Reception& umts) {
  return umts.level < poorRscp || umts.ecNo < poorEcNo;
}

bool isGood(const Reception& umts) {
  return umts.level > goodRscp && umts.ecNo > goodEcNo;
}

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

void CellSelection::look(const std::vector<Reception>& receptions, const Tie& tie, double seconds) {
  const auto change = wanted(receptions, tie);
  if (timer_.pass(change, seconds)) serving_ = change->to;
}

std::optional<CellChange> CellSelection::wanted(const std::vector<Reception>& receptions,
                                                const Tie& tie) const {
  const Choice choice{.umts = best(receptions, Technology::umts, tie),
                      .gsm = best(receptions, Technology::gsm, tie)};
  if (!serving_) {
    const bool takesUmts = choice.umts && (!choice.gsm || !isPoor(receptions[*choice.umts]));
    const auto found = takesUmts ? choice.umts : choice.gsm;
    return found ? std::optional(CellChange{found, selectionTime}) : std::nullopt;
  }
  if (!isSuitable(cells_[*serving_], receptions[*serving_])) return refuge(receptions, choice, tie);
  return cells_[*serving_].technology == Technology::umts ? fromUmts(receptions, choice, tie)
                                                          : fromGsm(receptions, choice, tie);
}

// From an unsuitable cell to any that will do. A connection that has none is lost with its cell.
CellChange CellSelection::refuge(const std::vector<Reception>& receptions, const Choice& choice,
                                 const Tie& tie) const {
  const bool isOnGsm = cells_[*serving_].technology == Technology::gsm;
  const bool takesUmts = choice.umts && !(tie.isConnected && isOnGsm);
  if (takesUmts && !isPoor(receptions[*choice.umts])) return {choice.umts};
  if (choice.gsm) return {choice.gsm};
  return takesUmts ? CellChange{choice.umts} : CellChange{std::nullopt, lossTime};
}

std::optional<CellChange> CellSelection::fromUmts(const std::vector<Reception>& receptions,
                                                  const Choice& choice, const Tie& tie) const {
  const Reception& serving = receptions[*serving_];
  if (choice.umts && receptions[*choice.umts].ecNo > serving.ecNo + rankMargin)
    return CellChange{choice.umts, tie.softSet.empty() ? umtsReselectionTime : 0};
  if (isPoor(serving) && choice.gsm && criterionC1(receptions[*choice.gsm]) > comfortableC1)
    return CellChange{choice.gsm, technologyTime};
  return std::nullopt;
}

std::optional<CellChange> CellSelection::fromGsm(const std::vector<Reception>& receptions,
                                                 const Choice& choice, const Tie& tie) const {
  if (!tie.isConnected && choice.umts && isGood(receptions[*choice.umts]))
    return CellChange{choice.umts, technologyTime};
  const double margin = tie.isConnected ? handoverMargin : reselectHysteresis;
  if (choice.gsm && criterionC2(receptions[*choice.gsm]) > criterionC2(receptions[*serving_]) + margin)
    return CellChange{choice.gsm, tie.isConnected ? handoverTime : gsmReselectionTime};
  return std::nullopt;
}

// Of the suitable ones.
std::optional<std::size_t> CellSelection::best(const std::vector<Reception>& receptions,
                                               Technology technology, const Tie& tie) const {
  std::optional<std::size_t> found;
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    if (cells_[cell].technology != technology || !isSuitable(cells_[cell], receptions[cell])) continue;
    if (!allows(tie, cell)) continue;
    if (!found || rank(cells_[cell], receptions[cell]) > rank(cells_[*found], receptions[*found]))
      found = cell;
  }
  return found;
}

bool CellSelection::allows(const Tie& tie, std::size_t cell) const {
  if (!serving_ || !tie.isConnected) return true;
  if (!tie.softSet.empty() && cells_[cell].technology == Technology::umts)
    return std::ranges::find(tie.softSet, cell) != tie.softSet.end();
  return cells_[cell].locationArea.plmn == cells_[*serving_].locationArea.plmn;
}

}  // namespace kelvasi::sim::gsm
