#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace platform {

/// The page that a command line such as "file:page.htm#topic" asks for: the topic's own page
/// "page-topic.htm" where there is one, as the desktop's opener loses what stands behind the '#',
/// else "page.htm". The first of the folders that is there is looked at; those given as relative
/// lie beside the program. Empty where it has neither page.
std::filesystem::path HelpPage(const std::vector<std::filesystem::path>& folders,
                               const std::string& commandLine);

/// Shows a help page in the desktop's own browser, as a process that nothing waits for. Where the
/// page or the program that opens it is not there, or that has failed within so many milliseconds,
/// returns that in a sentence, and says it on the error stream. Later failures are not known.
std::string StartHelpViewer(const std::vector<std::filesystem::path>& folders,
                            const std::string& commandLine, int milliseconds);

}  // namespace platform
