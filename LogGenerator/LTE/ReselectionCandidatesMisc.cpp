// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/ReselectionCandidatesMisc.h"

#include "LogGenerator/LTE/ReselectionCandidates.h"

namespace kelvasi {

namespace {

using lte::reselectionCandidates::layout;

constexpr std::array logCodes{lte::reselectionCandidates::logCode};

constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "Serving EARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "serving E-ARFCN")},
    Row{.key = "Serving Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(layout, "serving cell identity")},
};
constexpr std::array records{
    RecordRows{lte::reselectionCandidates::logCode, lte::reselectionCandidates::minimumLength, layout, rows,
               lte::reselectionCandidates::serving},
};

constexpr StateSection section{.name = "Reselection Candidates",
                               .trace = "Reselection Candidates",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::serving};

}  // namespace

ReselectionCandidatesMisc::ReselectionCandidatesMisc(const Platform& platform)
    : StateDecoder(platform, section) {}

}  // namespace kelvasi
