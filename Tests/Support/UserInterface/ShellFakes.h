// SPDX-License-Identifier: Apache-2.0
// Preferences, files and date formatters in the test's hands.
#pragma once

#include <functional>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "Platform/DateFormatter.h"
#include "Platform/Files.h"
#include "Platform/Preferences.h"
#include "Plist/Description.h"

namespace kelvasi::test {

class FakePreferences : public Preferences {
 public:
  std::optional<bool> boolean(std::string_view domain, std::string_view key) const override {
    const auto found = values.find({std::string(domain), std::string(key)});
    return found == values.end() ? std::nullopt : std::optional(found->second);
  }
  void setBoolean(std::string_view domain, std::string_view key, bool value) override {
    values[{std::string(domain), std::string(key)}] = value;
    note("set", domain, std::string(key) + (value ? " true" : " false"));
  }
  void flush(std::string_view domain) override { note("flush", domain, ""); }
  void postChangeNotice(std::string_view domain, std::string_view key) override {
    note("notice", domain, key);
  }

  std::map<std::pair<std::string, std::string>, bool> values;  // by domain and key
  std::vector<std::string> journal;

 private:
  void note(std::string_view what, std::string_view domain, std::string_view rest) {
    journal.push_back(std::string(what) + " " + std::string(domain));
    if (!rest.empty()) journal.back() += " " + std::string(rest);
  }
};

class FakeFiles : public Files {
 public:
  bool exists(const std::string& path) const override {
    if (asked) asked();
    return existing.contains(path);
  }
  bool write(const std::string& path, std::span<const std::uint8_t> bytes) override {
    if (isFull) return false;
    written[path] = Bytes(bytes.begin(), bytes.end());
    ++writes;
    return true;
  }

  std::set<std::string> existing;
  std::function<void()> asked;  // called before every answer
  std::map<std::string, Bytes> written;
  int writes = 0;
  bool isFull = false;
};

// Writes a date as its description, after the pattern.
class FakeDateFormatters : public DateFormatters {
 public:
  std::unique_ptr<DateFormatter> makeDateFormatter(std::string_view pattern) const override {
    return std::make_unique<Formatter>(std::string(pattern));
  }

 private:
  struct Formatter : DateFormatter {
    explicit Formatter(std::string itsPattern) : pattern(std::move(itsPattern)) {}
    std::string stringFromDate(PlistDate date) const override { return pattern + " of " + description(date); }
    std::string pattern;
  };
};

}  // namespace kelvasi::test
