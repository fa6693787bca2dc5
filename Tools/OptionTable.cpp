// SPDX-License-Identifier: Apache-2.0
#include "Tools/OptionTable.h"

#include <nlohmann/json.hpp>

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

Json namesOf(const CLI::Option& option) {
  Json names = Json::array();
  for (const std::string& name : option.get_snames()) names.push_back("-" + name);
  for (const std::string& name : option.get_lnames()) names.push_back("--" + name);
  return names;
}

Json described(const CLI::Option& option) {
  const bool isFlag = option.get_items_expected_max() == 0;
  return {{"names", namesOf(option)},
          {"positional", option.nonpositional() ? "" : option.get_name(true)},
          {"type", isFlag ? "" : option.get_type_name()},
          {"description", option.get_description()},
          {"flag", isFlag},
          {"required", option.get_required()},
          {"many", option.get_expected_max() > 1}};
}

Json described(const CLI::App& app) {
  Json options = Json::array();
  for (const CLI::Option* option : app.get_options()) {
    if (!option->get_group().empty()) options.push_back(described(*option));
  }
  Json verbs = Json::array();
  for (const CLI::App* verb : app.get_subcommands({})) verbs.push_back(described(*verb));
  return {{"name", app.get_name()},
          {"description", app.get_description()},
          {"footer", app.get_footer()},
          {"options", options},
          {"verbs", verbs}};
}

}  // namespace

std::string optionTable(const CLI::App& app, const WordsByType& words) {
  Json table = described(app);
  table["words"] = words;
  return table.dump(2) + "\n";
}

}  // namespace kelvasi
