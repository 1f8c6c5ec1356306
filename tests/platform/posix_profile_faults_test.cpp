// The profile where the machine fails it: nothing that was stored is lost, and the player is told.

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "tests/platform/failing_machine.h"
#include "tests/platform/profile_helpers.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;
using platform::OpenProfile;
using testing::HasSubstr;

TEST_F(ProfileTest, LivesWithoutAPlaceToWrite) {
  fs::create_directories(m_file);  // where the file should be
  EXPECT_EQ(GetInt("x"), 7);
  EXPECT_FALSE(Store("x", 3));
  EXPECT_TRUE(fs::is_directory(m_file));
  // Where the folder should be.
  WriteFile(m_folder.Path() / "file", "no folder");
  m_pProfile = OpenProfile(m_folder.Path() / "file" / "p.toml");
  EXPECT_EQ(GetInt("x"), 7);
  EXPECT_FALSE(Store("x", 3));
  // Where the fresh file is to be written.
  const fs::path other = m_folder.Path() / "Other" / "p.toml";
  WriteFile(other, "[S]\nx = 5\n");
  fs::create_directories(other.string() + ".new");
  m_pProfile = OpenProfile(other);
  EXPECT_FALSE(Store("x", 3));
  EXPECT_EQ(ReadFile(other), "[S]\nx = 5\n");
}

TEST_F(ProfileTest, TellsOfATroubleOnceUntilItIsOver) {
  EXPECT_TRUE(Store("x", 1));
  fs::create_directories(m_file.string() + ".new");
  EXPECT_FALSE(Store("x", 2));
  EXPECT_FALSE(Store("y", 2));
  const auto troubles = m_pProfile->TakeTroubles();
  ASSERT_EQ(troubles.size(), 1U);
  EXPECT_THAT(troubles[0], HasSubstr(m_file.string() + " cannot be written: File exists."));
  EXPECT_FALSE(Store("x", 2));
  EXPECT_TRUE(m_pProfile->TakeTroubles().empty());
  fs::remove(m_file.string() + ".new");
  EXPECT_TRUE(Store("x", 2));
  fs::create_directories(m_file.string() + ".new");
  EXPECT_FALSE(Store("x", 3));
  EXPECT_EQ(m_pProfile->TakeTroubles(), troubles);
}

TEST_F(ProfileTest, LeavesTheFileThatCannotBeReadOrWritten) {
  WriteFile(m_file.string() + ".new", "what a killed game has left");
  for (bool* fails : {&g_bReadFails, &g_bFlushFails}) {
    EXPECT_TRUE(Store("x", 1));
    *fails = true;
    EXPECT_EQ(GetInt("x"), fails == &g_bReadFails ? 7 : 1);
    EXPECT_FALSE(Store("y", 2));
    *fails = false;
    EXPECT_FALSE(m_pProfile->TakeTroubles().empty());
    EXPECT_EQ(ReadFile(m_file), "[S]\nx = 1\n");
    EXPECT_FALSE(exists(fs::path(m_file) += ".new"));
  }
}

TEST_F(ProfileTest, StoresAllOrNothingWhenMemoryRunsOut) {
  // A stream takes memory for 512 letters first, and so many end here at the end of a line.
  std::string before = "[S]\naaaaaaa = 1\n";
  for (int i = 10; i < 99; ++i) before += "k" + std::to_string(i) + " = 1\n";
  before += "x = 1\n";
  bool stored = false;
  for (int allocations = 1; !stored; ++allocations) {
    WriteFile(m_file, before);
    m_pProfile = OpenProfile(m_file);
    g_nAllocationsLeft = allocations;
    const int read = GetInt("x");
    g_nAllocationsLeft = 0;
    EXPECT_TRUE(read == 1 || !m_pProfile->TakeTroubles().empty()) << allocations;
    g_nAllocationsLeft = allocations;
    stored = Store("y", 2);
    g_nAllocationsLeft = 0;
    ASSERT_EQ(ReadFile(m_file), stored ? before + "y = 2\n" : before) << allocations;
  }
  EXPECT_TRUE(KeptCopies().empty());
  // Also where the parser has something to say.
  for (int allocations = 1; allocations < 200; ++allocations) {
    fs::remove(Kept(1));
    WriteFile(m_file, "[S");
    g_nAllocationsLeft = allocations;
    EXPECT_EQ(GetInt("x"), 7);
    g_nAllocationsLeft = 0;
    EXPECT_EQ(ReadFile(exists(m_file) ? m_file : Kept(1)), "[S");
  }
}

TEST_F(ProfileTest, IsTheOwnersUnlessTheOwnerSharesIt) {
  constexpr auto kOwn = fs::perms::owner_read | fs::perms::owner_write;
  constexpr auto kShared = kOwn | fs::perms::group_read;
  std::vector<mode_t> flushed;
  g_onFlush = [&flushed](int descriptor) {
    struct stat status {};
    fstat(descriptor, &status);
    flushed.push_back(status.st_mode);
  };
  EXPECT_TRUE(Store("x", 1));
  g_onFlush = nullptr;
  // The fresh file, and the folder in which it then takes the old one's name.
  ASSERT_EQ(flushed.size(), 2U);
  EXPECT_EQ(flushed[0], mode_t{S_IFREG | 0600});
  EXPECT_TRUE(S_ISDIR(flushed[1]));
  for (const char* ending : {"", ".lock"}) {
    EXPECT_EQ(fs::status(fs::path(m_file) += ending).permissions(), kOwn) << ending;
  }
  fs::permissions(m_file, kShared);
  EXPECT_TRUE(Store("x", 2));
  EXPECT_EQ(fs::status(m_file).permissions(), kShared);
}

class LongNameTest : public ProfileTest {
 protected:
  /// Too long for anything behind it but ".new" and ".lock".
  LongNameTest() : ProfileTest(std::string(248, 'n')) {}
};

TEST_F(LongNameTest, DestroysNothingThatCannotBeKept) {
  for (const char* text : {"[S", "S = 3\n", "[S]\nx = 'text'\n"}) {
    WriteFile(m_file, text);
    EXPECT_EQ(GetInt("x"), 7);
    EXPECT_FALSE(Store("x", 4));
    EXPECT_EQ(ReadFile(m_file), text);
    EXPECT_FALSE(m_pProfile->TakeTroubles().empty());
    EXPECT_EQ(std::distance(fs::directory_iterator(m_file.parent_path()), {}), 2);
  }
}

TEST_F(ProfileTest, WaitsNoMoreThanASecondForAGameThatHasStopped) {
  EXPECT_TRUE(Store("x", 1));
  const int lock = open((m_file.string() + ".lock").c_str(), O_RDWR);
  ASSERT_EQ(flock(lock, LOCK_EX), 0);
  g_bSleepsInNoTime = true;
  EXPECT_FALSE(Store("x", 2));
  EXPECT_EQ(GetInt("x"), 1);
  EXPECT_GE(g_nMicrosecondsSlept, 900000);
  EXPECT_LE(g_nMicrosecondsSlept, 1000000);
  WriteFile(m_file, "[S");
  EXPECT_EQ(GetInt("x"), 7);
  EXPECT_EQ(ReadFile(m_file), "[S");  // not while the other one may be about to replace it
  EXPECT_LE(g_nMicrosecondsSlept, 2000000);
  g_bSleepsInNoTime = false;
  close(lock);
  EXPECT_TRUE(Store("x", 3));
}

}  // namespace
}  // namespace feltside::tests
