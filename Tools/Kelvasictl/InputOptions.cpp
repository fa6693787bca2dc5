// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/InputOptions.h"

#include <CLI/CLI.hpp>

#include "Tools/Kelvasictl/TechnologyOption.h"

namespace kelvasi {

namespace {

std::string checkJobs(const std::string& text) {
  const bool isNumber = !text.empty() && text.size() <= 3 &&
                        text.find_first_not_of("0123456789") == std::string::npos && std::stoi(text) > 0;
  return isNumber ? std::string() : "\"" + text + "\" is no number of jobs from 1 to 999";
}

void check(const InputOptions& options) {
  if (!options.isLive && options.captures.empty()) throw CLI::RequiredError("CAPTURE or --live");
  if (!options.isLive && options.live.seconds) throw CLI::ValidationError("--seconds", "needs --live");
  if (!options.isLive) return;
  if (!options.captures.empty()) throw CLI::ValidationError("--live", "takes no CAPTURE");
  if (options.jobs) throw CLI::ValidationError("--jobs", "is for captures, not for --live");
  if (!options.technology.empty())
    throw CLI::ValidationError("--technology", "is told by the daemon with --live");
}

}  // namespace

void InputOptions::addTo(CLI::App& verb, const std::string& severalCaptures) {
  verb.add_option("CAPTURE", captures,
                  "pcap, pcapng or DLF files or snapshots, gzip'd or zstd'd too; - is the standard input. " +
                      severalCaptures);
  addTechnology(verb, technology);
  verb.add_flag("--live", isLive, "listen to a telephony daemon instead of reading captures");
  live.addTo(verb);
  verb.callback([this] { check(*this); });
}

CLI::Option* InputOptions::addJobsTo(CLI::App& verb, const std::string& help) {
  return verb.add_option("--jobs", jobs, help)->type_name("N")->check(CLI::Validator(checkJobs, ""));
}

}  // namespace kelvasi
