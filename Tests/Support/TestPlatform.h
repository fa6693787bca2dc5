// SPDX-License-Identifier: Apache-2.0
// The surroundings of generators and decoders, in the test's hands.
#pragma once

#include <map>
#include <string>
#include <utility>

#include "Platform/Clock.h"
#include "Platform/Platform.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/Resources.h"
#include "Tests/Support/RecordingLog.h"

namespace kelvasi::test {

class FakeClock : public Clock {
 public:
  PlistDate now() const override { return time; }
  ZoneState localZone(PlistDate) const override { return zone; }

  PlistDate time{1709647629};  // 2024-03-05 14:07:09 UTC
  ZoneState zone;
};

class FakeResources : public Resources {
 public:
  std::vector<std::string> pathsOfType(std::string_view type) const override {
    std::vector<std::string> paths;
    for (const auto& [name, bytes] : files) {
      if (name.ends_with("." + std::string(type))) paths.push_back("/package/" + name);
    }
    return paths;
  }
  std::optional<Bytes> contents(std::string_view name, std::string_view type) const override {
    const auto file = files.find(std::string(name) + "." + std::string(type));
    return file == files.end() ? std::nullopt : std::optional(file->second);
  }
  std::optional<std::string> bundleVersion() const override { return version; }
  std::string buildTime() const override { return "Jun  6 2017 22:20:30"; }

  std::map<std::string, Bytes> files;  // "Orvane_GSM.plist" to its bytes
  std::optional<std::string> version = "1.0";
};

// Serialises nothing; parses only the bytes that the test announced. For tests that need no real property
// lists.
class FakeSerialiser : public PlistSerialiser {
 public:
  std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) const override {
    const auto known = parsed.find(Bytes(bytes.begin(), bytes.end()));
    return known == parsed.end() ? std::nullopt : std::optional(known->second);
  }
  std::optional<Bytes> serialiseXml(const PlistValue&) const override { return std::nullopt; }
  std::optional<Bytes> serialiseBinary(const PlistValue&) const override { return std::nullopt; }

  // Bytes that stand for `value` from now on.
  Bytes standFor(PlistValue value) {
    Bytes token{static_cast<std::uint8_t>('#'), static_cast<std::uint8_t>(parsed.size())};
    parsed.emplace(token, std::move(value));
    return token;
  }

  std::map<Bytes, PlistValue> parsed;
};

struct TestPlatform {
  RecordingLog log;
  RecordingTrace trace;
  FakeSerialiser plists;
  FakeResources resources;
  FakeClock clock;

  Platform platform() { return {log, trace, plists, resources, clock}; }
};

}  // namespace kelvasi::test
