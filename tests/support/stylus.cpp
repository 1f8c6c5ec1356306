#include "tests/support/stylus.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "tests/support/golden.h"

namespace feltside::tests {

Json ReadJson(const std::string& text) { return Json::parse(text); }

std::string ToText(const Json& value) { return value.dump(); }

Stylus::Stylus(const std::string& profile) {
  if (!profile.empty()) WriteFile(ProfileFile(), profile);
  // Another edition's, where the environment names one.
  const char* const other = std::getenv("FELTSIDE_STYLUS");
  m_program = StartChild(other == nullptr ? FELTSIDE_STYLUS : other, m_folder.Path());
}

Stylus::~Stylus() {
  const int code = EndChild(m_program);
  const std::string errors = Errors();
  EXPECT_EQ(code, 0) << errors;
  EXPECT_EQ(errors.find("Sanitizer"), std::string::npos) << errors;
  EXPECT_EQ(errors.find("runtime error"), std::string::npos) << errors;
}

Json Stylus::Send(const std::string& line) {
  std::fputs((line + "\n").c_str(), m_program.input);
  std::fflush(m_program.input);
  std::string answer;
  for (int c = 0; c != '\n'; answer.push_back(static_cast<char>(c))) {
    c = std::getc(m_program.output);
    if (c == EOF) throw std::runtime_error("no answer to: " + line + "\n" + Errors());
  }
  return ReadJson(answer);
}

platform::CBitmap Stylus::Shot() {
  const std::filesystem::path file = m_folder.Path() / "shot.png";
  Send("shot " + file.string());
  return LoadPicture(file);
}

std::string Stylus::Errors() const {
  std::ostringstream text;
  text << std::ifstream(m_folder.Path() / "errors").rdbuf();
  return text.str();
}

std::filesystem::path Stylus::ProfileFile() const {
  return m_folder.Path() / "Quillworks" / "Feltside.toml";
}

}  // namespace feltside::tests
