// SPDX-License-Identifier: Apache-2.0
// kelvasictl fields: every row of every technology, and what stands behind it.

#include "LogGenerator/LogGenerator.h"
#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/FieldList.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/Kelvasictl/TechnologyOption.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct FieldsOptions {
  std::string technology;
  std::string format = "json";
  SurroundingsOptions surroundings;
};

int run(const FieldsOptions& options) {
  OfflineSurroundings surroundings(options.surroundings);
  std::vector<TechnologyFields> fields;
  for (const std::string_view technology : technologyIds()) {
    if (!options.technology.empty() && options.technology != technology) continue;
    const auto generator = LogGenerator::generatorFromTechnology(technology, surroundings.platform());
    TechnologyFields& each = fields.emplace_back();
    each.technology = shortTechnologyName(technology);
    generator->describe(each.catalog);
  }
  printOut(options.format == "json" ? fieldsJson(fields) : fieldsMarkdown(fields));
  return exitSuccess;
}

}  // namespace

Action declareFields(OptionSet verb) {
  const auto options = std::make_shared<FieldsOptions>();
  addTechnology(verb, options->technology, "IFX, Orvane_GSM, Orvane_CDMA, Orvane_LTE or Orvane_UTRAN2 only");
  verb.add("--format", options->format, "json (the default) or markdown")
      .type("FORMAT")
      .oneOf({"json", "markdown"});
  options->surroundings.addTo(verb);
  return [options](MessageTally&) { return run(*options); };
}

}  // namespace kelvasi
