// SPDX-License-Identifier: Apache-2.0
// The display templates as they are installed, through the same reader and tree as the viewer's.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "Model/KelvasiModelNode.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/LogGenerator/Sections/ClassIndexes.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::UnorderedElementsAreArray;

PlistValue displayTemplate(const std::string& name) {
  std::ifstream file(KELVASI_RESOURCES_DIRECTORY "/" + name + ".plist", std::ios::binary);
  const Bytes bytes(std::istreambuf_iterator<char>(file), {});
  return LibplistSerialiser().parse(bytes).value_or(PlistValue());
}

// All that are installed. The object stream brings its display with it and has none.
std::vector<std::string> templateNames() {
  std::vector<std::string> names;
  for (const auto& file : std::filesystem::directory_iterator(KELVASI_RESOURCES_DIRECTORY)) {
    if (file.path().extension() == ".plist") names.push_back(file.path().stem().string());
  }
  return names;
}

// What stands in a template: a lookup name, or a section and its kind; groups are looked into.
void collect(const PlistValue& object, std::vector<std::string>& found) {
  for (const auto& [key, value] : *object.dictionary()) {
    if (key == "_sorted") continue;
    if (value.string()) {
      found.push_back(*value.string());
    } else if (value.array()) {
      found.push_back(key + (value.array()->empty() ? ": list" : ": list that is not empty"));
    } else if (value.dictionary()->empty()) {
      found.push_back(key + ": dictionary");
    } else {
      collect(value, found);
    }
  }
}

std::vector<std::string> found(const PlistValue& object) {
  std::vector<std::string> found;
  collect(object, found);
  std::ranges::sort(found);
  return found;
}

template <typename Index>
std::vector<std::string> sectionsOf() {
  test::TestPlatform surroundings;
  const Index index(surroundings.platform());
  std::vector<std::string> sections;
  for (const auto& decoder : index.decoders()) {
    const bool isList = decoder->sectionKind() == SectionKind::list;
    sections.push_back(std::string(decoder->getSectionName()) + (isList ? ": list" : ": dictionary"));
  }
  return sections;
}

// What the decoders of the technology can show.
template <typename... Index>
std::vector<std::string> wanted(const std::string& name, testing::Types<Index...>) {
  std::vector<std::string> wanted;
  if (name == "C2KTemplate") {
    for (const std::string_view lookupName : test::c2kLookupNames()) wanted.emplace_back(lookupName);
  }
  ((name == test::Required<Index>::displayTemplate ? void(wanted = sectionsOf<Index>()) : void()), ...);
  std::ranges::sort(wanted);
  return wanted;
}
std::vector<std::string> wanted(const std::string& name) {
  return wanted(name, test::ClassIndexes());
}

TEST(Templates, EachHoldsWhatItsDecodersShowOnceAndNothingElse) {
  EXPECT_THAT(templateNames(), UnorderedElementsAreArray({"C2KTemplate", "LTE", "Orvane_GSM", "UTRAN"}));
  for (const std::string& name : templateNames())
    EXPECT_EQ(found(displayTemplate(name)), wanted(name)) << name;
}

using Path = std::vector<std::string>;

void collectPaths(const PlistDictionary& entries, const Path& above, std::vector<Path>& paths) {
  for (const auto& [key, value] : entries) {
    if (key == "_sorted") continue;
    Path path = above;
    path.push_back(key);
    paths.push_back(path);
    if (value.dictionary()) collectPaths(*value.dictionary(), path, paths);
  }
}

std::vector<Path> pathsIn(const PlistValue& object) {
  std::vector<Path> paths;
  collectPaths(*object.dictionary(), {}, paths);
  return paths;
}

// The template with the entry at `path` taken out, and with `changed` in its place, if anything.
PlistValue broken(const std::string& name, const Path& path, const std::string& key,
                  const PlistValue& changed) {
  const PlistValue whole = displayTemplate(name);
  PlistValue group = whole;
  for (std::size_t step = 0; step + 1 < path.size(); ++step) group = group.dictionary()->get(path[step]);
  group.dictionary()->remove(path.back());
  group.dictionary()->set(key, changed);
  return whole;
}

PlistValue entryAt(const std::string& name, const Path& path) {
  PlistValue entry = displayTemplate(name);
  for (const std::string& step : path) entry = entry.dictionary()->get(step);
  return entry;
}

TEST(Templates, AnEntryThatIsMissingMisspeltOrOfAnotherKindDoesNotPass) {
  for (const std::string& name : templateNames()) {
    for (const Path& path : pathsIn(displayTemplate(name))) {
      const PlistValue entry = entryAt(name, path);
      const std::string& key = path.back();
      const PlistValue otherKind = entry.array() ? PlistValue(PlistDictionary::make()) : PlistArray::make();
      EXPECT_NE(found(broken(name, path, key, {})), wanted(name)) << name << " " << key;
      EXPECT_NE(found(broken(name, path, key, otherKind)), wanted(name)) << name << " " << key;
      EXPECT_NE(found(broken(name, path, key, "kOther")), wanted(name)) << name << " " << key;
      const bool isNamedByKey = entry.array() || (entry.dictionary() && entry.dictionary()->empty());
      if (isNamedByKey) {
        EXPECT_NE(found(broken(name, path, key + "x", entry)), wanted(name)) << name << " " << key;
      }
    }
  }
}

std::vector<std::string> groupsOf(const std::string& name) {
  PathDictionary nodes;
  const NodeRef root = KelvasiModelNode::makeTreeFromObject(displayTemplate(name), nodes);
  std::vector<std::string> names;
  for (const NodeRef& group : *root->childNodes()) names.push_back(group->displayName());
  return names;
}

TEST(Templates, AreOrderedFromTheServingCellOutwards) {
  EXPECT_THAT(groupsOf("Orvane_GSM"), ElementsAre("Registration", "GSM", "UMTS", "Packet Data", "SIM"));
  EXPECT_THAT(groupsOf("LTE"), ElementsAre("Serving Cell", "Idle Mode Neighbors", "Reselection",
                                           "Connected Mode", "SIM and Data"));
  EXPECT_THAT(groupsOf("UTRAN"),
              ElementsAre("Serving Cell", "Neighbor Cells", "Channel Quality", "SIM and Data"));
  EXPECT_THAT(groupsOf("C2KTemplate"), ElementsAre("1x", "1x System", "EV-DO", "EV-DO Data Rates"));
}

}  // namespace
}  // namespace kelvasi
