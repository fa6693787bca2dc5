// SPDX-License-Identifier: Apache-2.0
// The command line of a program, with --help and --version.
#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "Tools/OptionSet.h"

namespace kelvasi {

class CommandLine {
 public:
  CommandLine(const std::string& name, const std::string& description);
  ~CommandLine();

  // Where options are declared before they are parsed.
  OptionSet options() { return OptionSet(*app_); }
  OptionSet addVerb(const std::string& name, const std::string& help);
  // "PROGRAM help VERB" says what "PROGRAM VERB --help" does. After all other verbs.
  void addHelpVerb();

  // What a shell offers for values of this type, "TECH" for one.
  void offerWords(const std::string& type, std::vector<std::string> words) {
    words_[type] = std::move(words);
  }

  // The status to end with at once, all being said on the standard streams: help was asked for, or the
  // arguments make no sense. Nothing when the program is to run.
  std::optional<int> parse(int argumentCount, const char* const* arguments);
  // Whether this verb is the one to run.
  bool asksFor(const std::string& verb) const;

 private:
  int refuse(const std::string& reason) const;

  std::unique_ptr<CLI::App> app_;
  std::map<std::string, std::vector<std::string>> words_;
};

}  // namespace kelvasi
