// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PackageResources.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <fstream>
#include <string>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using namespace std::string_view_literals;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::MatchesRegex;
using ::testing::Not;
using testing::TemporaryDirectory;
using testing::Variable;

class PackageResourcesTest : public ::testing::Test {
 protected:
  void create(const std::string& name, const std::string& text = "") {
    std::ofstream(directory.file(name)) << text;
  }
  const TemporaryDirectory directory;
  const PackageResources resources{directory.path()};
};

TEST_F(PackageResourcesTest, ListsOneTypeByName) {
  for (const char* name : {"b.plist", "a-2.plist", "a.plist", "B.plist", "c.txt", "plist", "d.plist.bak"}) {
    create(name);
  }
  EXPECT_THAT(resources.pathsOfType("plist"), ElementsAre("B.plist", "a.plist", "a-2.plist", "b.plist"));
}

TEST_F(PackageResourcesTest, ListsNeitherHiddenFilesNorDirectoriesNorWhatIsInThem) {
  create(".hidden.plist");
  create(".plist");
  std::filesystem::create_directories(directory.path() / "folder.plist");
  create("folder.plist/inner.plist");
  EXPECT_THAT(resources.pathsOfType("plist"), IsEmpty());
}

TEST_F(PackageResourcesTest, WhereThePackageLiesIsNoPartOfAPath) {
  const auto package = directory.path() / "UTRAN" / "utran";
  std::filesystem::create_directories(package);
  create("UTRAN/utran/LTE.plist");
  EXPECT_THAT(PackageResources(package).pathsOfType("plist"), ElementsAre("LTE.plist"));
  EXPECT_THAT(PackageResources(package / "").pathsOfType("plist"), ElementsAre("LTE.plist"));
}

TEST_F(PackageResourcesTest, AMissingDirectoryHasNoResources) {
  const PackageResources missing(directory.path() / "missing");
  EXPECT_THAT(missing.pathsOfType("plist"), IsEmpty());
  EXPECT_EQ(missing.contents("LTE", "plist"), std::nullopt);
}

TEST_F(PackageResourcesTest, ReadsBytesByNameAndType) {
  create("LTE.plist", std::string("\0\xff text", 7));
  EXPECT_EQ(resources.contents("LTE", "plist"), (Bytes{0, 0xff, ' ', 't', 'e', 'x', 't'}));
  EXPECT_EQ(resources.contents("LTE", "txt"), std::nullopt);
  EXPECT_EQ(resources.contents("lte", "plist"), std::nullopt);
}

TEST_F(PackageResourcesTest, NamesDoNotLeadElsewhere) {
  create("inside.plist", "x");
  std::filesystem::create_directories(directory.path() / "folder");
  create("folder/inner.plist", "x");
  create(".hidden.plist", "x");
  for (const std::string_view name :
       {"folder/inner"sv, "./inside"sv, ".hidden"sv, ""sv, "inside\0"sv, ".."sv}) {
    EXPECT_EQ(resources.contents(name, "plist"), std::nullopt) << name;
  }
  EXPECT_EQ(resources.contents("inside", "plist/"), std::nullopt);
  EXPECT_EQ(resources.contents("inside", ""), std::nullopt);
  EXPECT_EQ(resources.contents("folder", "/inner.plist"), std::nullopt);
  EXPECT_NE(resources.contents("inside", "plist"), std::nullopt);
}

TEST_F(PackageResourcesTest, ReadsUpToItsLargestFile) {
  create("large.bin");
  std::filesystem::resize_file(directory.file("large.bin"), PackageResources::largestFile);
  EXPECT_EQ(resources.contents("large", "bin")->size(), PackageResources::largestFile);
  std::filesystem::resize_file(directory.file("large.bin"), PackageResources::largestFile + 1);
  EXPECT_EQ(resources.contents("large", "bin"), std::nullopt);
}

TEST_F(PackageResourcesTest, APipeIsNoResourceAndHoldsNobodyUp) {
  ASSERT_EQ(::mkfifo(directory.file("pipe.plist").c_str(), 0600), 0);
  EXPECT_EQ(resources.contents("pipe", "plist"), std::nullopt);
  EXPECT_THAT(resources.pathsOfType("plist"), IsEmpty());
}

TEST_F(PackageResourcesTest, TheEnvironmentChoosesTheDirectory) {
  const Variable variable("KELVASI_RESOURCES", directory.path().native());
  create("a.plist");
  EXPECT_THAT(PackageResources().pathsOfType("plist"), ElementsAre("a.plist"));
}

TEST_F(PackageResourcesTest, WithoutTheVariableItBelongsToTheProgram) {
  const Variable variable("KELVASI_RESOURCES", "");
  const auto program = std::filesystem::read_symlink("/proc/self/exe");
  EXPECT_EQ(PackageResources::standardDirectory(), PackageResources::directoryFor(program.parent_path()));
}

TEST_F(PackageResourcesTest, ProgramsHaveTheirResourcesBesideThemOrInTheirInstallation) {
  const auto programs = directory.path() / "bin";
  const auto installed = PackageResources::directoryFor(programs);
  EXPECT_EQ(installed.filename(), "kelvasi");
  EXPECT_THAT(installed.native(), Not(HasSubstr("..")));
  std::filesystem::create_directories(programs / "Resources");
  EXPECT_EQ(PackageResources::directoryFor(programs), programs / "Resources");
}

TEST_F(PackageResourcesTest, StatesTheProjectsVersion) {
  EXPECT_EQ(resources.bundleVersion(), PROJECT_VERSION_TEXT);
}

TEST_F(PackageResourcesTest, StatesTheBuildTimeInTwentyCharacters) {
  EXPECT_THAT(resources.buildTime(), MatchesRegex("[A-Z][a-z][a-z] [ 1-3][0-9] 2[0-9][0-9][0-9] "
                                                  "[0-2][0-9]:[0-5][0-9]:[0-6][0-9]"));
}

}  // namespace
}  // namespace kelvasi
