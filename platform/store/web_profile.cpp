// The profile in what a browser keeps for a page: an item for every value, a number as its digits,
// a string behind a quotation mark. A browser that gives pages processes of their own does not keep
// them from writing at the same instant; only values that both change can then be the other's.

#include <algorithm>
#include <charconv>
#include <cstdlib>
#include <cstring>

#include "platform/store/profile.h"
#include "platform/store/web_storage.h"

namespace platform {
namespace {

namespace fs = std::filesystem;
using Value = CProfileSection::Value;

constexpr char kStringMark = '"';
constexpr char kKeepsNothing[] =
    "This browser keeps nothing for this page: the defaults hold, and what is set or won is lost "
    "when the game ends.";
constexpr char kFull[] = "This browser has no room left to keep what was set or won.";

std::string ToItem(const Value& value) {
  return value.number ? std::to_string(*value.number) : kStringMark + value.text;
}

/// What is neither a number nor a string is an empty string.
Value FromItem(const std::string& item) {
  if (!item.empty() && item[0] == kStringMark) return {std::nullopt, item.substr(1)};
  int number = 0;
  const char* const end = item.data() + item.size();
  const auto [stop, error] = std::from_chars(item.data(), end, number);
  if (error != std::errc() || stop != end) return {};
  return {number, {}};
}

class CWebProfile : public CProfile {
 public:
  explicit CWebProfile(std::string name) : m_strName(std::move(name)) {}

  std::optional<CProfileSections> Read() override;
  bool Update(const std::string& section, const Change& change) override;

 private:
  std::string m_strName;
};

std::optional<CProfileSections> CWebProfile::Read() {
  char* const stored = page_stored((m_strName + "/").c_str());
  if (stored == nullptr) {
    Tell(kKeepsNothing);
    return std::nullopt;
  }
  std::map<std::string, std::map<std::string, Value>> values;
  for (const char* at = stored; *at != '\0';) {
    const std::string name = at;
    at += name.size() + 1;
    const std::size_t slash = std::min(name.find('/'), name.size() - 1);
    values[name.substr(0, slash)][name.substr(slash + 1)] = FromItem(at);
    at += std::strlen(at) + 1;
  }
  std::free(stored);
  CProfileSections sections;
  for (auto& [name, section] : values) sections.emplace(name, std::move(section));
  return sections;
}

bool CWebProfile::Update(const std::string& section, const Change& change) {
  std::optional<CProfileSections> sections = Read();
  if (!sections) return false;
  CProfileSection& values = (*sections)[section];
  change(values);
  std::string list;
  for (const auto& [entry, value] : values.Changes()) list += entry + '\0' + ToItem(value) + '\0';
  const std::string beginning = m_strName + "/" + section + "/";
  const bool stored = page_store(beginning.c_str(), list.c_str()) != 0;
  if (stored) {
    ForgetTold();
  } else {
    Tell(kFull);
  }
  return stored;
}

}  // namespace

std::unique_ptr<CProfile> OpenProfile(const fs::path& file) {
  return std::make_unique<CWebProfile>(fs::path(file).replace_extension().string());
}

}  // namespace platform
