// SPDX-License-Identifier: Apache-2.0
#include "Tools/OperatorFile.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using testing::TemporaryDirectory;
using testing::Variable;

class OperatorFileTest : public ::testing::Test {
 protected:
  OperatorFileTest() { std::filesystem::create_directories(path.parent_path()); }
  void write(const std::string& text) const { std::ofstream(path) << text; }

  const TemporaryDirectory directory;
  const Variable config{"XDG_CONFIG_HOME", directory.path().native()};
  const std::filesystem::path path = directory.path() / "kelvasi/operators.csv";
};

TEST_F(OperatorFileTest, WithoutOneTheBuiltInNamesHold) {
  const LoadedOperators loaded = loadOperators();
  EXPECT_EQ(loaded.operators.describe({262, 1, 2}), "262-01 Telekom (Germany)");
  EXPECT_THAT(loaded.complaints, IsEmpty());
}

TEST_F(OperatorFileTest, ItsNamesStandOverThem) {
  write("262,01,Bench\n");
  const LoadedOperators loaded = loadOperators();
  EXPECT_EQ(loaded.operators.describe({262, 1, 2}), "262-01 Bench (Germany)");
  EXPECT_THAT(loaded.complaints, IsEmpty());
}

TEST_F(OperatorFileTest, WhatIsWrongWithItIsSaidByFileAndLine) {
  write("262,01,Bench\n262,02,\n");
  const LoadedOperators loaded = loadOperators();
  EXPECT_THAT(loaded.complaints, ElementsAre(path.native() + ": line 2 has no name"));
  EXPECT_EQ(loaded.operators.describe({262, 1, 2}), "262-01 Bench (Germany)");
}

TEST_F(OperatorFileTest, OneThatIsTooLargeOrNoFileIsNotRead) {
  write("");
  std::filesystem::resize_file(path, (1U << 20) + 1);
  EXPECT_THAT(loadOperators().complaints, ElementsAre(HasSubstr(path.native())));
  std::filesystem::remove(path);
  std::filesystem::create_directories(path);
  EXPECT_THAT(loadOperators().complaints, ElementsAre(HasSubstr(path.native())));
}

}  // namespace
}  // namespace kelvasi
