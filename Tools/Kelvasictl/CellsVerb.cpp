// SPDX-License-Identifier: Apache-2.0
// kelvasictl cells: the cells of captures or of a live link.
#include "Tools/Kelvasictl/CellRecords.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/SurveyRun.h"
#include "Tools/Kelvasictl/Verb.h"
#include "Tools/OperatorFile.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(For each cell, over all captures: band and MHz of its channel (all of them where bands overlap), network, area and
cell identity as far as the records of a serving cell told them, the roles that it had, when it was first and last
heard of, in how many messages, and count, least, mean, most and latest of its levels. NDJSON has a line for each
cell, CSV one for each level of a cell.)";

int run(const SurveyOptions& options, MessageTally& tally) {
  survey::Cells cells;
  const auto take = [&](const Surveyed& surveyed) {
    cells.merge(surveyed.survey.cells());
    tally.add(surveyed.generator.intake());
  };
  const int status = runSurvey(options, {.take = take});
  const LoadedOperators names = loadOperators();
  for (const std::string& line : names.complaints) complain(line);
  printCells(cells, names.operators, options.format.format(), printOut);
  if (cells.dropped() > 0)
    complain(std::to_string(cells.dropped()) + " cells made way for later ones and are not shown");
  return status;
}

}  // namespace

Action declareCells(OptionSet verb) {
  return declareSurvey(verb, footer, run);
}

}  // namespace kelvasi
