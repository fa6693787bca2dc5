// SPDX-License-Identifier: Apache-2.0
// kelvasictl dissector: a dissector of Wireshark, made from the tables of the decoders.
#include <array>
#include <filesystem>
#include <memory>

#include "LogGenerator/LogGenerator.h"
#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/Dissector/DissectorTables.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct DissectorOptions {
  SurroundingsOptions surroundings;
};

// What dissects by the tables, in the order in which it is loaded.
constexpr std::array<std::string_view, 11> scripts{"names",        "view",   "memory",   "rows",
                                                   "calculated",   "cdma",   "plist",    "plist_xml",
                                                   "plist_binary", "daemon", "dissector"};

std::string beginning(const std::string& version) {
  return "-- SPDX-License-Identifier: GPL-2.0-or-later\n"
         "-- Copyright The Kelvasi authors\n"
         "-- Dissects captures of Kelvasi's log channel (link type DLT_USER0). Made by kelvasictl " +
         version +
         ", as \"kelvasictl dissector\"\n-- makes it: whatever is changed here is lost with the next one.\n";
}

std::string scriptText(const SurroundingsOptions& options, std::string_view name) {
  const std::filesystem::path directory =
      options.resources ? std::filesystem::path(*options.resources) : PackageResources::standardDirectory();
  const auto bytes = PackageResources(directory / "wireshark").contents(name, "lua");
  if (!bytes) throw ToolError((directory / "wireshark" / name).native() + ".lua cannot be read");
  return {bytes->begin(), bytes->end()};
}

std::vector<TechnologyFields> allFields(const Platform& platform) {
  std::vector<TechnologyFields> fields;
  for (const std::string_view technology : technologyIds()) {
    TechnologyFields& each = fields.emplace_back();
    each.technology = shortTechnologyName(technology);
    LogGenerator::generatorFromTechnology(technology, platform)->describe(each.catalog);
  }
  return fields;
}

int run(const DissectorOptions& options) {
  OfflineSurroundings surroundings(options.surroundings);
  std::string text = beginning(surroundings.resources.bundleVersion().value_or(""));
  text += dissectorTables(allFields(surroundings.platform()));
  for (const std::string_view name : scripts) text += "\n" + scriptText(options.surroundings, name);
  printOut(text);
  return exitSuccess;
}

}  // namespace

Action declareDissector(OptionSet verb) {
  const auto options = std::make_shared<DissectorOptions>();
  options->surroundings.addTo(verb);
  return [options](MessageTally&) { return run(*options); };
}

}  // namespace kelvasi
