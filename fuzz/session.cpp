#include "fuzz/session.h"

#include <iostream>
#include <sstream>

#include "fuzz/bytes.h"
#include "platform/host/offscreen_host.h"
#include "stylus/stylus.h"

namespace feltside::fuzz {
namespace {

/// Keeps what the program says of troubles out of the log, where thousands are had on purpose.
class CQuiet {
 public:
  CQuiet() : m_pErrors(std::cerr.rdbuf(nullptr)) {}
  ~CQuiet() {
    std::cerr.rdbuf(m_pErrors);
    std::cerr.clear();
  }
  CQuiet(const CQuiet&) = delete;
  CQuiet& operator=(const CQuiet&) = delete;

 private:
  std::streambuf* m_pErrors;
};

}  // namespace

CSession::CSession(const std::string& settings) {
  if (!settings.empty()) tests::WriteFile(m_file, settings);
}

std::vector<nlohmann::json> CSession::Play(const std::vector<std::string>& lines) const {
  std::stringstream in;
  std::stringstream out;
  for (const std::string& line : lines) in << line << '\n';
  int exitCode = 0;
  {
    const CQuiet quiet;
    platform::OffscreenHost host(m_folder.Path());
    platform::SetHost(&host);
    CFeltsideApp app;
    exitCode = CStylus(host, app, in, out).Run();
  }
  Require(exitCode == 0, "ends with " + std::to_string(exitCode));
  std::vector<nlohmann::json> answers;
  for (std::string line; std::getline(out, line);) answers.push_back(nlohmann::json::parse(line));
  return answers;
}

std::vector<std::string> CSession::Kept() const {
  std::vector<std::string> texts;
  for (const auto& entry : std::filesystem::directory_iterator(m_file.parent_path())) {
    const std::string name = entry.path().filename().string();
    if (name.find(".damaged-") != std::string::npos) texts.push_back(tests::ReadFile(entry.path()));
  }
  return texts;
}

}  // namespace feltside::fuzz
