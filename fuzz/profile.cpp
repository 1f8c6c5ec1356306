// Any text as the settings' file: it is understood or not, and a change leaves all else in it as it
// was.

#include "platform/store/toml_text.h"

#undef NDEBUG
#define TOML_ASSERT(condition) static_assert(true)
#define TOML_EXCEPTIONS 0
#include <toml++/toml.h>

#include "fuzz/bytes.h"

namespace feltside::fuzz {
namespace {

using platform::ChangeSection;
using platform::ReadSections;

/// A document without what a change replaces.
toml::table WithoutChanges(const std::string& text) {
  toml::table document = toml::parse(text).table();
  if (toml::table* section = document["Settings"].as_table()) {
    section->erase("NUMDECKS");
    section->erase("High0");
    if (section->empty()) document.erase("Settings");
  } else {
    document.erase("Settings");
  }
  return document;
}

void Change(const std::string& text) {
  platform::CProfileSection change;
  change.Set("NUMDECKS", 2);
  change.Set("High0", "Ann 500");
  const auto changed = ChangeSection(text, "Settings", change);
  Require(changed.has_value(), "cannot be written again");
  auto sections = ReadSections(changed->text);
  Require(sections && (*sections)["Settings"].GetInt("NUMDECKS", 0) == 2, "the number is lost");
  Require((*sections)["Settings"].GetString("High0", "") == "Ann 500", "the string is lost");
  const bool hasNan = text.find("nan") != std::string::npos;  // it is not even itself
  Require(hasNan || WithoutChanges(text) == WithoutChanges(changed->text),
          "something else is lost:\n" + changed->text);
  const auto again = ChangeSection(changed->text, "Settings", change);
  Require(again && again->text == changed->text, "is another text the second time");
  Require(again->foreign.empty(), "finds its own values foreign");
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  if (platform::ReadSections(text)) feltside::fuzz::Change(text);
  return 0;
}
