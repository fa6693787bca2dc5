// SPDX-License-Identifier: Apache-2.0
// A model on fake surroundings, with a template and a daemon that answers "Orvane_GSM" unless told otherwise.
#pragma once

#include <string>

#include "Model/KelvasiModel.h"
#include "Telvon/Technology.h"
#include "Tests/Support/FakeLink.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::test {

// Besides what FakeSerialiser does: writes a dictionary as the text of its keys, so that commands can be told
// apart.
class KeyWritingSerialiser : public FakeSerialiser {
 public:
  std::optional<Bytes> serialiseXml(const PlistValue& value) const override {
    Bytes text;
    for (const auto& [key, entry] : *value.dictionary()) text.insert(text.end(), key.begin(), key.end());
    if (text == refused) return std::nullopt;
    return text;
  }
  Bytes refused;
};

struct ModelFixture {
  ModelFixture() {
    surroundings.log.isMasked = true;
    resources.files["Orvane_GSM.plist"] = plists.standFor(
        PlistDictionary::make({{"Process CO", PlistDictionary::make()}, {"List", PlistArray::make()}}));
    answerTechnology(kTelvonLogChannelTechnology_Orvane_GSM);
  }

  void answerTechnology(PlistValue technology) {
    answerWith(PlistDictionary::make({{"GetTechnology", std::move(technology)}}));
  }
  void answerWith(PlistValue reply) { link.technologyResult.reply = plists.standFor(std::move(reply)); }
  std::vector<std::string> errors() const { return surroundings.log.errors(); }

  TestPlatform surroundings;
  FakeResources& resources = surroundings.resources;
  KeyWritingSerialiser plists;
  FakeMainQueue queue;
  FakeLink link;
  int updates = 0;
  KelvasiModel model{
      {surroundings.log, surroundings.trace, plists, surroundings.resources, surroundings.clock},
      {queue, link, link},
      [this] { ++updates; }};
};

}  // namespace kelvasi::test
