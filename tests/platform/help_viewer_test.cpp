// The help viewer, with an opener of the test's own in the path.

#include "platform/host/help_viewer.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cstdlib>

#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

TEST(HelpViewerTest, StartsTheDesktopsOpenerAndKnowsWhereThereIsNone) {
  const TemporaryFolder folder;
  const auto opener = folder.Path() / "xdg-open";
  const auto heard = folder.Path() / "heard";
  const std::string path = std::getenv("PATH");
  WriteFile(folder.Path() / "help" / "page.htm", "");
  WriteFile(folder.Path() / "help" / "page-topic.htm", "");
  setenv("PATH", folder.Path().c_str(), 1);
  const auto start = [&folder](const std::string& commandLine) {
    return platform::StartHelpViewer({folder.Path() / "none", folder.Path() / "help"}, commandLine);
  };

  EXPECT_FALSE(start("file:page.htm#topic"));
  // Reading from a pipe waits until the opener has written into it.
  mkfifo(heard.c_str(), 0600);
  WriteFile(opener, "#!/bin/sh\necho noise; echo noise >&2\necho \"$1\" >" + heard.string() + "\n");
  chmod(opener.c_str(), 0700);
  testing::internal::CaptureStdout();
  testing::internal::CaptureStderr();
  for (const auto& [commandLine, page] :
       {std::pair("file:page.htm#topic", "page-topic.htm"), {"file:page.htm#other", "page.htm"}}) {
    EXPECT_TRUE(start(commandLine));
    EXPECT_EQ(ReadFile(heard), (folder.Path() / "help" / page).string() + "\n");
  }
  EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
  EXPECT_FALSE(start("file:missing.htm"));
  setenv("PATH", path.c_str(), 1);
}

}  // namespace
}  // namespace feltside::tests
