// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/InputOptions.h"

#include "Tools/Kelvasictl/TechnologyOption.h"

namespace kelvasi {

namespace {

std::string checkJobs(const std::string& text) {
  const bool isNumber = !text.empty() && text.size() <= 3 &&
                        text.find_first_not_of("0123456789") == std::string::npos && std::stoi(text) > 0;
  return isNumber ? std::string() : "\"" + text + "\" is no number of jobs from 1 to 999";
}

void check(const InputOptions& options) {
  if (!options.isLive && options.captures.empty()) throw WrongUsage::missing("CAPTURE or --live");
  if (!options.isLive && options.live.seconds) throw WrongUsage("--seconds", "needs --live");
  if (!options.isLive) return;
  if (!options.captures.empty()) throw WrongUsage("--live", "takes no CAPTURE");
  if (options.jobs) throw WrongUsage("--jobs", "is for captures, not for --live");
  if (!options.technology.empty()) throw WrongUsage("--technology", "is told by the daemon with --live");
}

}  // namespace

void InputOptions::addTo(OptionSet verb, const std::string& severalCaptures) {
  verb.add("CAPTURE", captures,
           "pcap, pcapng or DLF files or snapshots, gzip'd or zstd'd too; - is the standard input. " +
               severalCaptures);
  addTechnology(verb, technology);
  verb.addFlag("--live", isLive, "listen to a telephony daemon instead of reading captures");
  live.addTo(verb);
  verb.setCheck([this] { check(*this); });
}

Option InputOptions::addJobsTo(OptionSet verb, const std::string& help) {
  return verb.add("--jobs", jobs, help).type("N").check(checkJobs);
}

}  // namespace kelvasi
