// SPDX-License-Identifier: Apache-2.0
// Which cell serves the handset: selection, reselection and handover (3GPP TS 25.304, 45.008), simplified.
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/CellChange.h"
#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim::gsm {

// The path-loss criterion C1 of a GSM cell, dB; below 0 the cell does not serve.
double criterionC1(const Reception& reception);
// C1 with the offset that cells broadcast, dB.
double criterionC2(const Reception& reception);
bool isSuitable(const Cell& cell, const Reception& reception);

class CellSelection {
 public:
  // What keeps the handset from any cell that is better.
  struct Tie {
    bool isConnected = false;                   // to the network of the serving cell
    std::span<const std::size_t> softSet = {};  // the active set of a dedicated channel; empty without one
  };

  // The cells outlive the selection.
  explicit CellSelection(std::span<const Cell> cells) : cells_(cells) {}

  // Looks at the receptions, `seconds` after the last time. A connection is kept in its technology as long as
  // that serves at all; on a dedicated channel of UMTS it moves within its active set.
  void look(const std::vector<Reception>& receptions, const Tie& tie, double seconds);

  // Its place among the cells; nothing without service.
  std::optional<std::size_t> serving() const { return serving_; }

 private:
  // The best cell of each technology within the tie; nothing where none is suitable.
  struct Choice {
    std::optional<std::size_t> umts;
    std::optional<std::size_t> gsm;
  };

  std::optional<CellChange> wanted(const std::vector<Reception>& receptions, const Tie& tie) const;
  CellChange refuge(const std::vector<Reception>& receptions, const Choice& choice, const Tie& tie) const;
  std::optional<CellChange> fromUmts(const std::vector<Reception>& receptions, const Choice& choice,
                                     const Tie& tie) const;
  std::optional<CellChange> fromGsm(const std::vector<Reception>& receptions, const Choice& choice,
                                    const Tie& tie) const;
  std::optional<std::size_t> best(const std::vector<Reception>& receptions, Technology technology,
                                  const Tie& tie) const;
  bool allows(const Tie& tie, std::size_t cell) const;

  std::span<const Cell> cells_;
  std::optional<std::size_t> serving_;
  CellChangeTimer timer_;
};

}  // namespace kelvasi::sim::gsm
