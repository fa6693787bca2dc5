// SPDX-License-Identifier: Apache-2.0
// The display templates as they are installed, through the same reader and tree as the viewer's.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <map>

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Model/KelvasiModelNode.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Support/C2KLookupNames.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;

enum class Kind { rows, list };
using Sections = std::map<std::string, Kind>;

PlistValue displayTemplate(const std::string& name) {
  std::ifstream file(KELVASI_RESOURCES_DIRECTORY "/" + name + ".plist", std::ios::binary);
  const Bytes bytes(std::istreambuf_iterator<char>(file), {});
  return LibplistSerialiser().parse(bytes).value_or(PlistValue());
}

// The sections that the index has a decoder for, wherever they stand.
void collect(const PlistValue& object, const ClassIndex& index, Sections& sections) {
  ASSERT_TRUE(object.string() || object.dictionary() || object.array());
  if (!object.dictionary()) return;
  for (const auto& [key, value] : *object.dictionary()) {
    if (index.getClass(key)) {
      EXPECT_TRUE(sections.emplace(key, value.array() ? Kind::list : Kind::rows).second) << key;
    }
    collect(value, index, sections);
  }
}

template <typename Index>
Sections sectionsOf(const std::string& name) {
  test::TestPlatform surroundings;
  const Index index(surroundings.platform());
  Sections sections;
  collect(displayTemplate(name), index, sections);
  return sections;
}

std::vector<std::string> groupsOf(const std::string& name) {
  PathDictionary nodes;
  const NodeRef root = KelvasiModelNode::makeTreeFromObject(displayTemplate(name), nodes);
  std::vector<std::string> names;
  for (const NodeRef& group : *root->childNodes()) names.push_back(group->displayName());
  return names;
}

TEST(LTETemplate, HasEverySectionOnceAndOfItsDecodersKind) {
  EXPECT_EQ(sectionsOf<LTEClassIndex>("LTE"),
            (Sections{{"Serving Cell Info", Kind::rows},
                      {"Serving Cell Measurements", Kind::rows},
                      {"Connected mode LTE Intra-frequency Measurement", Kind::rows},
                      {"Measured Neighbor Cells", Kind::list},
                      {"Detected Cells", Kind::list},
                      {"Neighbor Measurements", Kind::rows},
                      {"Neighbor Cells List", Kind::list},
                      {"Reselection Candidates", Kind::rows},
                      {"Reselection Candidates List", Kind::list},
                      {"SIM Info", Kind::rows},
                      {"PDP Context Info", Kind::list}}));
}

TEST(LTETemplate, IsOrderedFromTheServingCellOutwards) {
  EXPECT_THAT(groupsOf("LTE"), ElementsAre("Serving Cell", "Idle Mode Neighbors", "Reselection",
                                           "Connected Mode", "SIM and Data"));
}

TEST(UTRANTemplate, HasEverySectionOnceAndOfItsDecodersKind) {
  EXPECT_EQ(sectionsOf<UTRANClassIndex>("UTRAN"), (Sections{{"RRC Info", Kind::rows},
                                                            {"Serving Cell Info", Kind::rows},
                                                            {"Neighbor Cell List", Kind::list},
                                                            {"GSM Neighbor Cell List", Kind::list},
                                                            {"TRCH BLER", Kind::list},
                                                            {"CCTRCH SIR", Kind::list},
                                                            {"SIM Info", Kind::rows},
                                                            {"PDP Context Info", Kind::list}}));
}

TEST(UTRANTemplate, IsOrderedFromTheServingCellOutwards) {
  EXPECT_THAT(groupsOf("UTRAN"),
              ElementsAre("Serving Cell", "Neighbor Cells", "Channel Quality", "SIM and Data"));
}

// The lookup names of the leaves, wherever they stand.
std::vector<std::string> lookupNames(const PlistValue& object) {
  std::vector<std::string> names;
  for (const auto& [key, value] : *object.dictionary()) {
    const auto inside = value.dictionary() ? lookupNames(value) : std::vector<std::string>{*value.string()};
    if (key != "_sorted") names.insert(names.end(), inside.begin(), inside.end());
  }
  return names;
}

TEST(C2KTemplate, UsesEveryLookupNameOnce) {
  EXPECT_THAT(lookupNames(displayTemplate("C2KTemplate")),
              testing::UnorderedElementsAreArray(test::c2kLookupNames));
}

TEST(C2KTemplate, ShowsTheVoiceSystemBeforeTheDataSystem) {
  EXPECT_THAT(groupsOf("C2KTemplate"), ElementsAre("1x", "1x System", "EV-DO", "EV-DO Data Rates"));
}

}  // namespace
}  // namespace kelvasi
