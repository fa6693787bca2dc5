#include "LogGenerator/LTE/ReselectionCandidatesList.h"

#include "LogGenerator/LTE/ReselectionCandidates.h"

namespace kelvasi {

namespace {

using namespace lte::reselectionCandidates;

constexpr std::array logCodes{logCode};

constexpr std::array candidateRows{
    Row{.key = "Candidate Priority", .field = indexIn(candidateLayout, "priority")},
};
constexpr std::array lteRows{
    Row{.key = "E ARFCN", .field = indexIn(lteLayout, "E-ARFCN")},
    Row{.key = "Cell ID", .field = indexIn(lteLayout, "cell identity")},
};
constexpr std::array utranRows{
    Row{.key = "U ARFCN", .field = indexIn(utranLayout, "UARFCN")},
    Row{.key = "PSC", .field = indexIn(utranLayout, "primary scrambling code")},
};
constexpr std::array geranRows{
    Row{.key = "ARFCN", .field = indexIn(geranLayout, "ARFCN")},
    Row{.key = "Band", .field = indexIn(geranLayout, "band")},
    Row{.key = "BSIC ID", .field = indexIn(geranLayout, "BSIC")},
};
constexpr std::array cdmaRows{
    Row{.key = "Band", .field = indexIn(cdmaLayout, "band")},
    Row{.key = "Channel", .field = indexIn(cdmaLayout, "channel")},
    Row{.key = "Pilot", .field = indexIn(cdmaLayout, "pilot")},
};

struct RatType {
  std::string_view text;
  std::span<const Field> layout = {};
  std::span<const Row> rows = {};
};
constexpr RatType otherRat{.text = "??"};
constexpr std::array ratTypes{
    RatType{"LTE", lteLayout, lteRows},        RatType{"UTRAN", utranLayout, utranRows},
    RatType{"GERAN", geranLayout, geranRows},  RatType{"CDMA1XRTT", cdmaLayout, cdmaRows},
    RatType{"CDMAHRPD", cdmaLayout, cdmaRows},
};

constexpr ListSection section{.name = "Reselection Candidates List",
                              .trace = "Reselection Candidates List",
                              .logCodes = logCodes,
                              .logCode = logCode,
                              .minimumLength = minimumLength,
                              .list = candidates,
                              .rows = candidateRows};

}  // namespace

ReselectionCandidatesList::ReselectionCandidatesList(const Platform& platform)
    : ListDecoder(platform, section) {}

void ReselectionCandidatesList::addEntry(RecordView record, std::size_t place) {
  const RecordView candidate = entry(record, place);
  const auto type = static_cast<std::size_t>(valueOf(candidate, fieldIn(candidateLayout, "RAT type")));
  const RatType& rat = type < ratTypes.size() ? ratTypes[type] : otherRat;
  RowWriter row = addRows();
  show(candidate, candidateLayout, candidateRows, row);
  row.text("Candidate RAT Type", rat.text);
  show(candidate.from(ratSpecific), rat.layout, rat.rows, row);
}

}  // namespace kelvasi
