#pragma once

#include <filesystem>
#include <string>

namespace platform {

/// The page that a command line such as "file:page.htm#topic" asks for: the topic's own page
/// "page-topic.htm" where there is one, as the desktop's opener loses what stands behind the '#',
/// else "page.htm". Empty where the help folder has neither.
std::filesystem::path HelpPage(const std::string& commandLine);

/// Shows a help page in the desktop's own browser, as a process that nothing waits for.
void StartHelpViewer(const std::string& commandLine);

}  // namespace platform
