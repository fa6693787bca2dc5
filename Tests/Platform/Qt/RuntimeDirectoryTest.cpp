// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/RuntimeDirectory.h"

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>
#include <optional>
#include <sstream>

#include "Tests/Platform/Qt/PortTest.h"

namespace kelvasi::test {
namespace {

using testing::HasSubstr;

class RuntimeDirectoryTest : public PortTest {
 protected:
  // The only error line when the directory is refused; "(opened)" otherwise.
  std::string refusalOf(const std::string& path) {
    ::setenv("TELVON_RUNTIME_DIR", path.c_str(), 1);
    log.clear();
    if (RuntimeDirectory::open(log)) return "(opened)";
    return log.errors().size() == 1 ? log.errors().front() : "(not one line)";
  }
  std::string inside(const char* name) const { return directory + "/" + name; }

  // Likewise of a port name.
  std::string refusalOfName(const std::string& name) {
    log.clear();
    if (RuntimeDirectory::open(log)->addressToReach(name, log)) return "(usable)";
    return log.errors().size() == 1 ? log.errors().front() : "(not one line)";
  }
};

TEST_F(RuntimeDirectoryTest, IsMadeForTheUserAlone) {
  EXPECT_EQ(refusalOf(inside("new")), "(opened)");
  struct stat made {};
  ASSERT_EQ(::stat(inside("new").c_str(), &made), 0);
  EXPECT_EQ(made.st_mode & 07777, 0700u);
}

TEST_F(RuntimeDirectoryTest, IsFoundAgain) {
  EXPECT_EQ(refusalOf(directory), "(opened)");
  EXPECT_EQ(refusalOf(directory + "/"), "(opened)");
}

TEST_F(RuntimeDirectoryTest, IsRefusedWithABitMoreThanItsOwner) {
  for (const mode_t extra : {01000U, 02000U, 04000U, 00010U, 00001U}) {
    ASSERT_EQ(::chmod(directory.c_str(), 0700U | extra), 0);
    EXPECT_EQ(refusalOf(directory), "Runtime directory \"" + directory + "\" refused: its mode is not 0700")
        << std::oct << extra;
  }
  ASSERT_EQ(::chmod(directory.c_str(), 0700), 0);
  EXPECT_EQ(refusalOf(directory), "(opened)");
}

TEST_F(RuntimeDirectoryTest, IsMadeForTheUserAloneInADirectoryThatHandsItsGroupOn) {
  ASSERT_EQ(::mkdir(inside("shared").c_str(), 0700), 0);
  ASSERT_EQ(::chmod(inside("shared").c_str(), 02700), 0);
  EXPECT_EQ(refusalOf(inside("shared/new")), "(opened)");
}

TEST_F(RuntimeDirectoryTest, ComesFromTheUsersRuntimeDirectoryOtherwise) {
  ::setenv("TELVON_RUNTIME_DIR", "", 1);
  ::setenv("XDG_RUNTIME_DIR", directory.c_str(), 1);
  const auto opened = RuntimeDirectory::open(log);
  ::unsetenv("XDG_RUNTIME_DIR");
  ASSERT_TRUE(opened);
  EXPECT_EQ(opened->path(), inside("telvon"));
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenNobodySaysWhere) {
  ::unsetenv("XDG_RUNTIME_DIR");
  EXPECT_EQ(refusalOf(""),
            "Runtime directory \"\" refused: neither TELVON_RUNTIME_DIR nor XDG_RUNTIME_DIR is set");
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenOthersCanEnter) {
  for (const mode_t mode : {0755u, 0701u, 0710u, 0777u}) {
    ::chmod(directory.c_str(), mode);
    EXPECT_THAT(refusalOf(directory), HasSubstr("its mode is not 0700"));
  }
  ::chmod(directory.c_str(), 0700);
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenItIsASymbolicLink) {
  std::filesystem::create_directory(inside("real"));
  ::chmod(inside("real").c_str(), 0700);
  std::filesystem::create_symlink("real", inside("link"));
  EXPECT_THAT(refusalOf(inside("link")), HasSubstr("is a symbolic link"));
  EXPECT_THAT(refusalOf(inside("link/")), HasSubstr("is a symbolic link"));
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenItIsNoDirectory) {
  std::ofstream(inside("file")) << "text";
  EXPECT_THAT(refusalOf(inside("file")), HasSubstr("is not a directory"));
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenItCannotBeMade) {
  EXPECT_THAT(refusalOf(inside("absent/child")), HasSubstr("cannot be made: No such file or directory"));
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenItsPathIsRelative) {
  EXPECT_THAT(refusalOf("telvon"), HasSubstr("not an absolute path"));
}

TEST_F(RuntimeDirectoryTest, IsRefusedWhenItBelongsToAnotherUser) {
  if (::geteuid() != 0) GTEST_SKIP() << "only root can give a directory away";
  std::filesystem::create_directory(inside("given"));
  ::chmod(inside("given").c_str(), 0700);
  ASSERT_EQ(::chown(inside("given").c_str(), 65534, 65534), 0);
  EXPECT_THAT(refusalOf(inside("given")), HasSubstr("belongs to another user"));
}

TEST_F(RuntimeDirectoryTest, TakesNamesThatAreFileNames) {
  EXPECT_EQ(refusalOfName("KelvasiApp.4b0f0c8e-0f5e-4a43-9d0c-1f6f7d0c2f11"), "(usable)");
  EXPECT_EQ(refusalOfName("a b.c-d"), "(usable)");
  EXPECT_THAT(refusalOfName(""), HasSubstr("is empty"));
  EXPECT_THAT(refusalOfName(".lock"), HasSubstr("begins with a dot"));
  EXPECT_THAT(refusalOfName("../telvon"), HasSubstr("begins with a dot"));
  EXPECT_THAT(refusalOfName("a/b"), HasSubstr("holds a slash"));
  EXPECT_THAT(refusalOfName(std::string("a\0b", 3)), HasSubstr("\"a?b\" refused: holds a control character"));
}

TEST_F(RuntimeDirectoryTest, TakesNamesAsLongAsASocketsPathMayBe) {
  const std::size_t longest = sizeof(sockaddr_un::sun_path) - 1 - directory.size() - 1;
  EXPECT_EQ(refusalOfName(std::string(longest, 'n')), "(usable)");
  EXPECT_THAT(refusalOfName(std::string(longest + 1, 'n')), HasSubstr("makes too long a path"));
}

TEST_F(RuntimeDirectoryTest, IsLockedByOneAtATime) {
  const auto opened = RuntimeDirectory::open(log);
  FileDescriptor first = opened->lock(log);
  EXPECT_TRUE(first);
  EXPECT_FALSE(opened->lock(log));
  EXPECT_EQ(log.errors().size(), 1u);
  first.close();
  EXPECT_TRUE(opened->lock(log));
}

// Of the group of this process, which need not have a name.
class SharedRuntimeDirectoryTest : public RuntimeDirectoryTest {
 protected:
  SharedRuntimeDirectoryTest() {
    ::setenv("TELVON_GROUP", std::to_string(::getegid()).c_str(), 1);
    ::setenv("TELVON_RUNTIME_DIR", path.c_str(), 1);
  }
  ~SharedRuntimeDirectoryTest() override { ::unsetenv("TELVON_GROUP"); }

  std::optional<RuntimeDirectory> openAsDaemon() {
    return RuntimeDirectory::open(log, RuntimeDirectory::Side::daemon);
  }
  static std::string modeOf(const std::string& name) {
    struct stat found {};
    if (::lstat(name.c_str(), &found) != 0) return "(absent)";
    std::ostringstream text;
    text << std::oct << (found.st_mode & 07777);
    return text.str();
  }

  const std::string path = inside("shared");
};

TEST_F(SharedRuntimeDirectoryTest, IsMadeByADaemonOnly) {
  EXPECT_THAT(refusalOf(path), HasSubstr("refused: No such file or directory"));
  EXPECT_TRUE(openAsDaemon());
  EXPECT_EQ(modeOf(path), "2750");
  EXPECT_EQ(modeOf(path + "/applications"), "3770");
  EXPECT_EQ(refusalOf(path), "(opened)");
}

TEST_F(SharedRuntimeDirectoryTest, IsRefusedUnlessItsModeIsTheGroups) {
  ASSERT_TRUE(openAsDaemon());
  for (const mode_t mode : {00700U, 00750U, 02770U, 02751U, 03750U}) {
    ASSERT_EQ(::chmod(path.c_str(), mode), 0);
    EXPECT_THAT(refusalOf(path), HasSubstr("its mode is not 2750")) << std::oct << mode;
  }
}

TEST_F(SharedRuntimeDirectoryTest, IsRefusedWhenItIsOfAnotherGroup) {
  if (::geteuid() != 0) GTEST_SKIP() << "only root can give a directory away";
  ASSERT_TRUE(openAsDaemon());
  ASSERT_EQ(::chown(path.c_str(), static_cast<uid_t>(-1), 65534), 0);
  ASSERT_EQ(::chmod(path.c_str(), 02750), 0);
  EXPECT_THAT(refusalOf(path), HasSubstr("its group is not that of TELVON_GROUP"));
}

TEST_F(SharedRuntimeDirectoryTest, OfAnotherUserIsForApplicationsOnly) {
  if (::geteuid() != 0) GTEST_SKIP() << "only root can give a directory away";
  ASSERT_TRUE(openAsDaemon());
  ASSERT_EQ(::chown(path.c_str(), 65534, static_cast<gid_t>(-1)), 0);
  ASSERT_EQ(::chmod(path.c_str(), 02750), 0);
  EXPECT_FALSE(openAsDaemon());
  EXPECT_THAT(log.errors().back(), HasSubstr("belongs to another user"));
  const auto opened = RuntimeDirectory::open(log);
  ASSERT_TRUE(opened);
  EXPECT_EQ(opened->addressToListen("KelvasiApp.1", log)->sun_path, path + "/applications/KelvasiApp.1");
  EXPECT_EQ(opened->addressToReach("telvon", log)->sun_path, path + "/telvon");
}

TEST_F(SharedRuntimeDirectoryTest, ItsOwnerFindsGuestsUnderNamesThatAreNotItsOwn) {
  const auto opened = openAsDaemon();
  ASSERT_TRUE(opened);
  for (const char* name : {"/applications/guest", "/applications/telvon", "/telvon"})
    std::ofstream(path + name) << "in the place of a socket";
  EXPECT_EQ(opened->addressToListen("telvon", log)->sun_path, path + "/telvon");
  EXPECT_EQ(opened->addressToReach("telvon", log)->sun_path, path + "/telvon");
  EXPECT_EQ(opened->addressToReach("guest", log)->sun_path, path + "/applications/guest");
}

TEST_F(SharedRuntimeDirectoryTest, TheVariableNamesAGroupOfThisProcess) {
  ::setenv("TELVON_GROUP", "no such group", 1);
  EXPECT_THAT(refusalOf(path), HasSubstr("refused: TELVON_GROUP names no group: no such group"));
  ::setenv("TELVON_GROUP", "4294967294", 1);
  EXPECT_THAT(refusalOf(path), HasSubstr("refused: this process is not in the group of TELVON_GROUP"));
  ::setenv("TELVON_GROUP", "", 1);  // as if it were not set
  EXPECT_EQ(refusalOf(path), "(opened)");
  EXPECT_EQ(modeOf(path), "700");
}

TEST_F(SharedRuntimeDirectoryTest, WhoeverTheGuestsLeadToIsNoProcessOfTheOwners) {
  const auto daemon = openAsDaemon();
  const auto atHome = daemon->allowedAt(*daemon->addressIn(path, "telvon", log));
  const auto atGuests = daemon->allowedAt(*daemon->addressIn(path + "/applications", "guest", log));
  EXPECT_TRUE(atHome.ofThisUser);
  EXPECT_FALSE(atGuests.ofThisUser);
  EXPECT_EQ(atGuests.ofGroup, ::getegid());
}

}  // namespace
}  // namespace kelvasi::test
