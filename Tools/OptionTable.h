// SPDX-License-Identifier: Apache-2.0
// The options of a program as data: the manuals and the shells' completions are made from it.
#pragma once

#include <CLI/CLI.hpp>
#include <map>
#include <string>
#include <vector>

namespace kelvasi {

// What may be given where an option's value is of this type: by "TECH" and so on.
using WordsByType = std::map<std::string, std::vector<std::string>>;

// JSON: {"name", "description", "footer", "options": [...], "verbs": [...], "words": {...}}. An option has
// "names" (none for a positional), "positional", "type" and "description" as --help shows them, "flag",
// "required" and "many"; a verb is like the program, without words. Hidden options are left out.
std::string optionTable(const CLI::App& app, const WordsByType& words);

}  // namespace kelvasi
