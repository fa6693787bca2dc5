// SPDX-License-Identifier: Apache-2.0
// Preferences as files, a domain each.
#include "Platform/QtDesktop/QtPreferences.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryDir>

namespace kelvasi {
namespace {

constexpr const char* own = "org.kelvasi.Kelvasi";
constexpr const char* shell = "org.kelvasi.Homerail";
constexpr const char* key = "HomerailShowGSMRSSI";

class QtPreferencesTest : public testing::Test {
 protected:
  void write(const char* domain, const QByteArray& contents) const {
    QFile file(pathOf(domain));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(contents);
  }
  QByteArray read(const char* domain) const {
    QFile file(pathOf(domain));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : "(no file)";
  }
  QString pathOf(const char* domain) const { return directory.filePath(QLatin1String(domain) + ".ini"); }

  QTemporaryDir directory;
  QtPreferences preferences{directory.path()};
};

TEST_F(QtPreferencesTest, AnAbsentFileOrKeyHasNoValue) {
  EXPECT_EQ(preferences.boolean(own, key), std::nullopt);
  write(own, "[General]\nOther=true\n");
  EXPECT_EQ(preferences.boolean(own, key), std::nullopt);
}

TEST_F(QtPreferencesTest, ReadsWhatAUserWrites) {
  struct Case {
    const char* text;
    std::optional<bool> value;
  };
  for (const Case& tried : {Case{"true", true}, Case{"True", true}, Case{"yes", true}, Case{"1", true},
                            Case{"false", false}, Case{"NO", false}, Case{"0", false},
                            Case{"maybe", std::nullopt}, Case{"", std::nullopt}, Case{"2", std::nullopt}}) {
    const QTemporaryDir another;
    QFile file(another.filePath("d.ini"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(QByteArray("[General]\nk=") + tried.text + "\n");
    file.close();
    EXPECT_EQ(QtPreferences(another.path()).boolean("d", "k"), tried.value) << tried.text;
  }
}

TEST_F(QtPreferencesTest, FlushingWritesTheFileOfTheDomainAndNoOther) {
  preferences.setBoolean(shell, key, true);
  preferences.setBoolean(own, key, true);
  EXPECT_EQ(read(shell), "(no file)");
  preferences.flush(shell);
  EXPECT_EQ(read(shell), "[General]\nHomerailShowGSMRSSI=true\n");
  EXPECT_EQ(read(own), "(no file)");
}

TEST_F(QtPreferencesTest, OtherKeysOfTheFileStay) {
  write(shell, "[General]\nBrightness=3\n");
  preferences.setBoolean(shell, key, false);
  preferences.flush(shell);
  EXPECT_EQ(read(shell), "[General]\nBrightness=3\nHomerailShowGSMRSSI=false\n");
}

TEST_F(QtPreferencesTest, WhatWasSetIsReadBack) {
  preferences.setBoolean(shell, key, true);
  EXPECT_EQ(preferences.boolean(shell, key), true);
  preferences.flush(shell);
  EXPECT_EQ(QtPreferences(directory.path()).boolean(shell, key), true);
}

TEST_F(QtPreferencesTest, ADirectoryThatCannotBeWrittenIsNoError) {
  QtPreferences lost("/proc/nothing");
  lost.setBoolean(shell, key, true);
  lost.flush(shell);
  EXPECT_FALSE(QFile::exists("/proc/nothing"));
}

TEST_F(QtPreferencesTest, TheStandardDirectoryIsTheUsersConfiguration) {
  qputenv("XDG_CONFIG_HOME", "/somewhere");
  EXPECT_EQ(QtPreferences::standardDirectory(), "/somewhere/preferences");
}

}  // namespace
}  // namespace kelvasi
