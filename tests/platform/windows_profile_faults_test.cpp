// The profile where Windows fails it: nothing that was stored is lost, and the player is told.

#include <gmock/gmock.h>
#include <windows.h>

#include <cstdlib>
#include <fstream>

#include "platform/host/profile_folder.h"
#include "tests/platform/failing_machine.h"
#include "tests/platform/profile_helpers.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;

/// As another program opens a file that it lets others do no more with than this.
HANDLE Hold(const fs::path& file, DWORD others) {
  return CreateFileW(file.c_str(), GENERIC_READ, others, nullptr, OPEN_EXISTING, 0, nullptr);
}

class WindowsFaults : public ProfileTest {
 protected:
  WindowsFaults() {
    g_bSleepsInNoTime = true;
    EXPECT_TRUE(Store("x", 1));
  }
  ~WindowsFaults() override { g_bSleepsInNoTime = false; }

  /// Nothing can be stored, of which the player is told in these words, and nothing is changed.
  void ExpectNothingStored(const std::string& told) {
    g_nMicrosecondsSlept = 0;
    EXPECT_FALSE(Store("x", 2));
    EXPECT_LE(g_nMicrosecondsSlept, 1000000);
    EXPECT_THAT(m_pProfile->TakeTroubles(), testing::Contains(HasSubstr(told)));
    EXPECT_FALSE(exists(fs::path(m_file) += ".new"));
  }
};

TEST_F(WindowsFaults, LeaveTheFileThatAnotherProgramHolds) {
  for (const DWORD others : {0UL, DWORD{FILE_SHARE_READ}}) {
    auto* const held = Hold(m_file, others);
    EXPECT_EQ(GetInt("x"), others == 0 ? 7 : 1);
    ExpectNothingStored(others == 0 ? "cannot be written: Permission denied"
                                    : "cannot be written: another program has it open");
    CloseHandle(held);
    EXPECT_EQ(ReadFile(m_file), "[S]\nx = 1\n");
    EXPECT_TRUE(Store("x", 1));
  }
}

TEST_F(WindowsFaults, WaitForAProgramThatLetsGoOfTheFile) {
  auto* const held = Hold(m_file, 0);
  g_afterSleep = [held] { CloseHandle(held); };
  EXPECT_EQ(GetInt("x"), 1);
  EXPECT_THAT(m_pProfile->TakeTroubles(), ElementsAre());
}

TEST_F(WindowsFaults, LeaveTheFileThatMayOnlyBeRead) {
  SetFileAttributesW(m_file.c_str(), FILE_ATTRIBUTE_READONLY);
  EXPECT_EQ(GetInt("x"), 1);
  ExpectNothingStored("cannot be written: Permission denied");
  SetFileAttributesW(m_file.c_str(), FILE_ATTRIBUTE_NORMAL);
  EXPECT_EQ(ReadFile(m_file), "[S]\nx = 1\n");
}

TEST_F(WindowsFaults, WaitNoMoreThanASecondForAGameThatHasStopped) {
  auto* const lock = Hold(fs::path(m_file) += ".lock", FILE_SHARE_READ | FILE_SHARE_WRITE);
  ASSERT_TRUE(LockFile(lock, 0, 0, 1, 0));
  ExpectNothingStored("another running game holds it");
  EXPECT_GE(g_nMicrosecondsSlept, 900000);
  EXPECT_EQ(GetInt("x"), 1);
  CloseHandle(lock);
  EXPECT_TRUE(Store("x", 3));
}

/// FELTSIDE_SMALL_DRIVE is a folder on a drive that is soon full.
TEST_F(WindowsFaults, LeaveTheFileOnAFullDrive) {
  const char* drive = std::getenv("FELTSIDE_SMALL_DRIVE");
  if (drive == nullptr) GTEST_SKIP() << "no FELTSIDE_SMALL_DRIVE";
  const fs::path file = fs::path(drive) / "Program.toml";
  m_pProfile = platform::OpenProfile(file);
  ASSERT_TRUE(Store("x", 1));
  // Some room may be left, but not for this.
  const std::string longText(20000, 'x');
  std::ofstream filling(fs::path(drive) / "filling", std::ios::binary);
  while (filling << 'x' << std::flush) continue;
  EXPECT_FALSE(Store("y", longText));
  EXPECT_THAT(m_pProfile->TakeTroubles(), ElementsAre(HasSubstr("No space left on device")));
  EXPECT_EQ(ReadFile(file), "[S]\nx = 1\n");
  EXPECT_FALSE(exists(fs::path(file) += ".new"));
}

TEST(WindowsProfileFolder, IsWhatTheEnvironmentNamesOrElseTheSystem) {
  const auto folderBy = [](const wchar_t* value) {
    _wputenv((std::wstring(L"APPDATA=") + value).c_str());
    return platform::DefaultProfileFolder();
  };
  const std::wstring before = _wgetenv(L"APPDATA");
  for (const wchar_t* named : {L"C:\\Users\\Ann\\Roaming", L"\\\\server\\users\\Ann"}) {
    EXPECT_EQ(folderBy(named), named);
  }
  for (const wchar_t* unusable : {L"", L"Roaming"}) {
    EXPECT_TRUE(folderBy(unusable).is_absolute()) << fs::path(unusable);
  }
  folderBy(before.c_str());
}

/// A person's folder that no code page has all letters of.
class ForeignNameTest : public ProfileTest {
 protected:
  ForeignNameTest() : ProfileTest("Zo\xC3\xAB \xC5\x81uk.toml") {}
};

TEST_F(ForeignNameTest, IsReadWrittenAndSaidAsItIs) {
  EXPECT_TRUE(Store("x", 1));
  EXPECT_EQ(GetInt("x"), 1);
  WriteFile(m_file, "[S");
  EXPECT_EQ(GetInt("x"), 7);
  EXPECT_THAT(m_pProfile->TakeTroubles(),
              ElementsAre(HasSubstr("\\Zo\xC3\xAB \xC5\x81uk.toml.damaged-1")));
}

}  // namespace
}  // namespace feltside::tests
