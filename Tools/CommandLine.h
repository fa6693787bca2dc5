// SPDX-License-Identifier: Apache-2.0
// The command line of a program, with --help and --version.
#pragma once

#include <CLI/CLI.hpp>
#include <optional>
#include <string>

#include "Tools/OptionTable.h"

namespace kelvasi {

class CommandLine {
 public:
  CommandLine(const std::string& name, const std::string& description);

  // Where options are declared before they are parsed.
  CLI::App& app() { return app_; }

  // What a shell offers for values of this type, "TECH" for one.
  void offerWords(const std::string& type, std::vector<std::string> words) {
    words_[type] = std::move(words);
  }

  // The status to end with at once, all being said on the standard streams: help was asked for, or the
  // arguments make no sense. Nothing when the program is to run.
  std::optional<int> parse(int argumentCount, const char* const* arguments);

 private:
  CLI::App app_;
  WordsByType words_;
};

}  // namespace kelvasi
