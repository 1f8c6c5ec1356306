#pragma once

#include <gtest/gtest.h>

#include "platform/host/utf8_path.h"
#include "platform/store/profile.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {

/// A profile in a folder that is not there yet; its values stand in section S.
class ProfileTest : public testing::Test {
 protected:
  explicit ProfileTest(const std::string& name = "Program.toml")
      : m_file(m_folder.Path() / "Maker" / platform::FromUtf8(name)) {}

  // Without memory for anything of their own, as that may be what is short.

  /// 7 where there is none.
  int GetInt(const std::string& entry, const std::string& section = "S") {
    auto sections = m_pProfile->Read();
    return sections && sections->contains(section) ? (*sections)[section].GetInt(entry, 7) : 7;
  }
  std::string GetString(const std::string& entry) {
    auto sections = m_pProfile->Read();
    return sections ? (*sections)["S"].GetString(entry, "absent") : "absent";
  }
  template <class Value>
  bool Store(const std::string& entry, const Value& value) {
    return m_pProfile->Update("S", [&](auto& section) { section.Set(entry, value); });
  }
  /// The texts that were set aside, from the first on.
  std::vector<std::string> KeptCopies() const {
    std::vector<std::string> texts;
    for (int i = 1; exists(Kept(i)); ++i) texts.push_back(ReadFile(Kept(i)));
    return texts;
  }
  std::filesystem::path Kept(int number) const {
    return m_file.string() + ".damaged-" + std::to_string(number);
  }

  TemporaryFolder m_folder;
  const std::filesystem::path m_file;
  std::unique_ptr<platform::CProfile> m_pProfile = platform::OpenProfile(m_file);
};

}  // namespace feltside::tests
