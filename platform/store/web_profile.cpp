// The profile in what a browser keeps for a page: an item for every value, a number as its digits,
// a string behind a quotation mark. The browser lets no other page come between reading and
// writing.

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
    "when "
    "the game ends.";
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

  CProfileSection Read(const std::string& section) override;
  bool Update(const std::string& section, const Change& change) override;

 private:
  std::string Beginning(const std::string& section) const {
    return m_strName + "/" + section + "/";
  }

  std::string m_strName;
};

CProfileSection CWebProfile::Read(const std::string& section) {
  char* const stored = page_stored(Beginning(section).c_str());
  if (stored == nullptr) {
    Tell(kKeepsNothing);
    return {};
  }
  std::map<std::string, Value> values;
  for (const char* at = stored; *at != '\0';) {
    const std::string entry = at;
    at += entry.size() + 1;
    values[entry] = FromItem(at);
    at += std::strlen(at) + 1;
  }
  std::free(stored);
  return CProfileSection(std::move(values));
}

bool CWebProfile::Update(const std::string& section, const Change& change) {
  CProfileSection values = Read(section);
  change(values);
  std::string list;
  for (const auto& [entry, value] : values.Changes()) list += entry + '\0' + ToItem(value) + '\0';
  const StoreResult result = page_store(Beginning(section).c_str(), list.c_str());
  if (result == kStored) {
    ForgetTold();
  } else {
    Tell(result == kStoreFull ? kFull : kKeepsNothing);
  }
  return result == kStored;
}

}  // namespace

std::unique_ptr<CProfile> OpenProfile(const fs::path& file) {
  return std::make_unique<CWebProfile>(fs::path(file).replace_extension().string());
}

}  // namespace platform
