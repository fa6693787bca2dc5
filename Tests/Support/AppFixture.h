// SPDX-License-Identifier: Apache-2.0
// The application on a toolkit in memory and fake surroundings.
#pragma once

#include <chrono>
#include <string>
#include <vector>

#include "App/KelvasiApp.h"
#include "Tests/Support/HexBytes.h"
#include "Tests/Support/ModelFixture.h"
#include "Tests/Support/UserInterface/MemoryUserInterface.h"
#include "Tests/Support/UserInterface/ShellFakes.h"

namespace kelvasi::test {

// Keeps what it was last asked to write.
class KeepingSerialiser : public KeyWritingSerialiser {
 public:
  std::optional<Bytes> serialiseXml(const PlistValue& value) const override {
    last = value;
    return KeyWritingSerialiser::serialiseXml(value);
  }
  mutable PlistValue last;
};

// The display has the branches "PDP Context Info", which holds what showList() gave it, and "Process CO".
struct AppFixture {
  AppFixture() {
    surroundings.log.isMasked = true;
    surroundings.resources.files["Orvane_GSM.plist"] = plists.standFor(PlistDictionary::make(
        {{"PDP Context Info", PlistArray::make()}, {"Process CO", PlistDictionary::make()}}));
    link.technologyResult.reply =
        plists.standFor(PlistDictionary::make({{"GetTechnology", kTelvonLogChannelTechnology_Orvane_GSM}}));
  }

  AppPlatform platform() {
    return {
        .core = {surroundings.log, surroundings.trace, plists, surroundings.resources, surroundings.clock},
        .link = {queue, link, link},
        .shell = {ui, preferences, dateFormatters, files},
        .paths = {.logDirectory = "/logs", .internalInstallMarker = "/marker"}};
  }

  // Launches, and runs what launching posted.
  void launch() {
    application.applicationDidFinishLaunching(application);
    queue.runPosted();
  }
  void tick() { queue.advance(std::chrono::seconds(2)); }
  // The daemon reports this list; it is shown with the next tick.
  void receiveList(PlistValue list) {
    const Bytes token = plists.standFor(std::move(list));
    link.receive(0, textRecord(0xFF0002, std::string(token.begin(), token.end())));
  }
  void showList(PlistValue list) {
    receiveList(std::move(list));
    tick();
  }
  std::vector<std::string> errors() const { return surroundings.log.errors(); }

  TestPlatform surroundings;
  KeepingSerialiser plists;
  FakeMainQueue queue;
  FakeLink link;
  FakePreferences preferences;
  FakeDateFormatters dateFormatters;
  FakeFiles files;
  MemoryUserInterface ui;
  KelvasiApp application{platform()};
};

}  // namespace kelvasi::test
