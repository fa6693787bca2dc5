// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/ReselectionCandidatesList.h"

#include "LogGenerator/LTE/ReselectionCandidates.h"

namespace kelvasi {

namespace {

using namespace lte::reselectionCandidates;

constexpr std::array logCodes{logCode};

constexpr std::array<std::string_view, 5> ratNames{"LTE", "UTRAN", "GERAN", "CDMA1XRTT", "CDMAHRPD"};
constexpr std::array candidateRows{
    Row{.key = "Candidate Priority",
        .quantity = quantity::priority,
        .field = indexIn(candidateLayout, "priority")},
    Row{.key = "Candidate RAT Type",
        .quantity = quantity::rat,
        .field = indexIn(candidateLayout, "RAT type"),
        .texts = ratNames,
        .otherwise = "??"},
};
constexpr std::array lteRows{
    Row{.key = "E ARFCN", .quantity = quantity::earfcn, .field = indexIn(lteLayout, "E-ARFCN")},
    Row{.key = "Cell ID", .quantity = quantity::pci, .field = indexIn(lteLayout, "cell identity")},
};
constexpr std::array utranRows{
    Row{.key = "U ARFCN", .quantity = quantity::uarfcn, .field = indexIn(utranLayout, "UARFCN")},
    Row{.key = "PSC",
        .quantity = quantity::scramblingCode,
        .field = indexIn(utranLayout, "primary scrambling code")},
};
constexpr std::array geranRows{
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(geranLayout, "ARFCN")},
    Row{.key = "Band", .quantity = quantity::band, .field = indexIn(geranLayout, "band")},
    Row{.key = "BSIC ID", .quantity = quantity::bsic, .field = indexIn(geranLayout, "BSIC")},
};
constexpr std::array cdmaRows{
    Row{.key = "Band", .quantity = quantity::bandClass, .field = indexIn(cdmaLayout, "band")},
    Row{.key = "Channel", .quantity = quantity::cdmaChannel, .field = indexIn(cdmaLayout, "channel")},
    Row{.key = "Pilot", .quantity = quantity::pnOffset, .field = indexIn(cdmaLayout, "pilot")},
};

struct RatType {
  std::span<const Field> layout = {};
  std::span<const Row> rows = {};
  CellFields cell = {};
};
constexpr CellFields lteCell{.family = RadioFamily::lte,
                             .channel = fieldIn(lteLayout, "E-ARFCN"),
                             .code = fieldIn(lteLayout, "cell identity")};
constexpr CellFields utranCell{.family = RadioFamily::umts,
                               .channel = fieldIn(utranLayout, "UARFCN"),
                               .code = fieldIn(utranLayout, "primary scrambling code")};
constexpr CellFields geranCell{.family = RadioFamily::gsm,
                               .channel = fieldIn(geranLayout, "ARFCN"),
                               .code = fieldIn(geranLayout, "BSIC")};
constexpr CellFields cdmaCell(RadioFamily family) {
  return {.family = family, .channel = fieldIn(cdmaLayout, "channel"), .code = fieldIn(cdmaLayout, "pilot")};
}
constexpr std::array ratTypes{
    RatType{lteLayout, lteRows, lteCell},
    RatType{utranLayout, utranRows, utranCell},
    RatType{geranLayout, geranRows, geranCell},
    RatType{cdmaLayout, cdmaRows, cdmaCell(RadioFamily::cdma)},
    RatType{cdmaLayout, cdmaRows, cdmaCell(RadioFamily::evdo)},
};
constexpr RatType otherRat;

const RatType& ratOf(RecordView candidate) {
  const auto type = static_cast<std::size_t>(valueOf(candidate, fieldIn(candidateLayout, "RAT type")));
  return type < ratTypes.size() ? ratTypes[type] : otherRat;
}

constexpr std::array others{
    RecordPart{logCode, lteLayout, lteRows, "byte 4 of an LTE entry"},
    RecordPart{logCode, utranLayout, utranRows, "byte 4 of a UTRAN entry"},
    RecordPart{logCode, geranLayout, geranRows, "byte 4 of a GERAN entry"},
    RecordPart{logCode, cdmaLayout, cdmaRows, "byte 4 of a CDMA entry"},
};
static_assert(ratSpecific == 4);

constexpr ListSection section{.name = "Reselection Candidates List",
                              .trace = "Reselection Candidates List",
                              .logCodes = logCodes,
                              .logCode = logCode,
                              .minimumLength = minimumLength,
                              .list = candidates,
                              .rows = candidateRows,
                              .role = CellRole::candidate,
                              .others = others};

}  // namespace

ReselectionCandidatesList::ReselectionCandidatesList(const Platform& platform)
    : ListDecoder(platform, section) {}

void ReselectionCandidatesList::addEntry(RecordView record, std::size_t place) {
  const RecordView candidate = entry(record, place);
  const RatType& rat = ratOf(candidate);
  RowWriter row = addRows();
  show(candidate, candidateLayout, candidateRows, row);
  show(candidate.from(ratSpecific), rat.layout, rat.rows, row);
}

CellIdentity ReselectionCandidatesList::cellOf(RecordView record, std::size_t place) const {
  const RecordView candidate = entry(record, place);
  const RecordView own = candidate.from(ratSpecific);
  return kelvasi::cellOf(ratOf(candidate).cell, own, own);
}

}  // namespace kelvasi
