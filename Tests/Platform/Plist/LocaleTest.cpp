// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>
#include <unistd.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

// A locale with a decimal comma, made for the test.
class DecimalComma : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ = std::filesystem::temp_directory_path() / ("kelvasi-locale-" + std::to_string(::getpid()));
    std::filesystem::create_directories(directory_);
    const std::string make =
        "localedef --no-archive -i de_DE -f UTF-8 " + (directory_ / "de_DE.UTF-8").native();
    const int made = std::system((make + " >/dev/null 2>&1").c_str());
    ::setenv("LOCPATH", directory_.c_str(), 1);
    if (made != 0 || !std::setlocale(LC_ALL, "de_DE.UTF-8")) GTEST_SKIP() << "the locales package is missing";
  }
  void TearDown() override {
    std::setlocale(LC_ALL, "C");
    ::unsetenv("LOCPATH");
    std::filesystem::remove_all(directory_);
  }

 private:
  std::filesystem::path directory_;
};

TEST_F(DecimalComma, ChangesNoRealReadOrWritten) {
  ASSERT_STREQ(std::localeconv()->decimal_point, ",");
  const LibplistSerialiser serialiser;
  EXPECT_EQ(serialiser.parse(testing::bytesOf(testing::xmlPlist("<real>1.5</real>"))), PlistValue(1.5));
  const auto bytes = serialiser.serialiseXml(-0.25);
  EXPECT_NE(testing::textOf(*bytes).find("<real>-0.25</real>"), std::string::npos);
}

TEST_F(DecimalComma, IsStillThereAfterwards) {
  EXPECT_EQ(LibplistSerialiser().parse({}), std::nullopt);
  char text[8];
  std::snprintf(text, sizeof text, "%.1f", 0.5);
  EXPECT_STREQ(text, "0,5");
}

}  // namespace
}  // namespace kelvasi
