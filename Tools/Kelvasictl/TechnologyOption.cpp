// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TechnologyOption.h"

#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

std::string readTechnology(std::string& text) {
  const auto id = technologyId(text);
  if (!id) return "there is no technology \"" + text + "\"";
  text = *id;
  return {};
}

}  // namespace

void addTechnology(OptionSet verb, std::string& technology, const std::string& help) {
  verb.add("--technology", technology, help).type("TECH").transform(readTechnology);
}

void addTechnology(OptionSet verb, std::string& technology) {
  addTechnology(verb, technology,
                "IFX, Orvane_GSM, Orvane_CDMA, Orvane_LTE or Orvane_UTRAN2; otherwise it is found from the "
                "messages");
}

}  // namespace kelvasi
