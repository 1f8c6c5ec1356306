// The help viewer, with an opener of the test's own in the path.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cstdlib>

#include "platform/host/help_viewer.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

TEST(HelpViewerTest, StartsTheDesktopsOpenerAndKnowsWhereItIsMissingOrFails) {
  const TemporaryFolder folder;
  const auto opener = folder.Path() / "xdg-open";
  const auto heard = folder.Path() / "heard";
  const char* set = std::getenv("PATH");
  const std::string path = set == nullptr ? "" : set;
  WriteFile(folder.Path() / "help" / "page.htm", "");
  WriteFile(folder.Path() / "help" / "page-topic.htm", "");
  setenv("PATH", folder.Path().c_str(), 1);
  const auto start = [&folder](const std::string& commandLine) {
    return platform::StartHelpViewer({folder.Path() / "none", folder.Path() / "help"}, commandLine,
                                     60000);
  };

  // Trouble is told with the path of what is there, or should be.
  const std::string page = (folder.Path() / "help" / "page-topic.htm").string();
  EXPECT_NE(start("file:page.htm#topic").find(" " + page + "."), std::string::npos);
  const auto beside = std::filesystem::read_symlink("/proc/self/exe").replace_filename("none");
  EXPECT_NE(platform::StartHelpViewer({"none"}, "file:page.htm", 0).find(" " + beside.string()),
            std::string::npos);
  WriteFile(opener, "#!/bin/sh\nexit 3\n");
  chmod(opener.c_str(), 0700);
  EXPECT_NE(start("file:page.htm#topic").find(" " + page + "."), std::string::npos);
  EXPECT_NE(start("file:missing.htm").find(folder.Path().string()), std::string::npos);
  // Reading from a pipe waits until the opener has written into it.
  mkfifo(heard.c_str(), 0600);
  WriteFile(opener,
            "#!/bin/sh\necho noise; echo noise >&2\necho \"$1\" >" + heard.string() + " &\n");
  testing::internal::CaptureStdout();
  testing::internal::CaptureStderr();
  for (const auto& [commandLine, opened] :
       {std::pair("file:page.htm#topic", "page-topic.htm"), {"file:page.htm#other", "page.htm"}}) {
    EXPECT_EQ(start(commandLine), "");
    EXPECT_EQ(ReadFile(heard), (folder.Path() / "help" / opened).string() + "\n");
  }
  EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
  setenv("PATH", path.c_str(), 1);
}

}  // namespace
}  // namespace feltside::tests
