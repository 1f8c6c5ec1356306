#include "platform/store/toml_text.h"

// The parser's own checks would end the program on some texts, or be taken for true with NDEBUG;
// without them it finds the same faults and says so.
#undef NDEBUG
#define TOML_ASSERT(condition) static_assert(true)
#define TOML_EXCEPTIONS 0  // its exception ends the program where memory runs out
#include <toml++/toml.h>

#include <limits>
#include <map>
#include <sstream>
#include <utility>

#include "platform/store/toml_check.h"

namespace platform {
namespace {

std::optional<CProfileSection::Value> ValueOf(const toml::node& node) {
  if (const auto* text = node.as_string()) return CProfileSection::Value{std::nullopt, text->get()};
  const auto number = node.value_exact<std::int64_t>();
  const bool fits = number && *number >= std::numeric_limits<int>::min() &&
                    *number <= std::numeric_limits<int>::max();
  if (!fits) return std::nullopt;
  return CProfileSection::Value{static_cast<int>(*number), {}};
}

CProfileSection ValuesOf(const toml::table& table) {
  std::map<std::string, CProfileSection::Value> values;
  for (const auto& [key, node] : table) {
    if (const auto value = ValueOf(node)) values.emplace(key.str(), *value);
  }
  return CProfileSection(std::move(values));
}

bool IsOfKind(const toml::node& node, const CProfileSection::Value& value) {
  return value.number ? node.is_integer() : node.is_string();
}

/// The table of a section, made where there is none; what stood there instead is foreign.
toml::table& TableOf(toml::table& document, const std::string& section, std::string& foreign) {
  if (document.contains(section) && !document[section].is_table()) foreign = section;
  if (!document[section].is_table()) document.insert_or_assign(section, toml::table());
  return *document[section].as_table();
}

// The library's own way to write tables and arrays forgets the quotation marks of some names, and
// computes lengths of numbers that have none; it writes the values that are neither.

/// A string as a plain quoted one: in the other forms some line ends do not come back as they were.
void WriteSimple(std::ostream& out, const toml::node& value) {
  out << toml::toml_formatter(value, toml::format_flags::allow_unicode_strings);
}

void WriteName(std::ostream& out, const toml::key& name) {
  constexpr std::string_view kPlain =
      "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789_-";
  if (!name.empty() && name.str().find_first_not_of(kPlain) == std::string_view::npos) {
    out << name.str();
  } else {
    WriteSimple(out, toml::value<std::string>(name.str()));
  }
}

/// Any value, in one line.
void WriteValue(std::ostream& out, const toml::node& value) {
  const char* separator = "";
  if (const toml::table* table = value.as_table()) {
    out << "{ ";
    for (const auto& [name, each] : *table) {
      out << std::exchange(separator, ", ");
      WriteName(out, name);
      WriteValue(out << " = ", each);
    }
    out << " }";
  } else if (const toml::array* array = value.as_array()) {
    out << "[ ";
    for (const toml::node& each : *array) WriteValue(out << std::exchange(separator, ", "), each);
    out << " ]";
  } else {
    WriteSimple(out, value);
  }
}

void WriteLine(std::ostream& out, const toml::key& name, const toml::node& value) {
  WriteName(out, name);
  WriteValue(out << " = ", value);
  out << '\n';
}

/// What stands outside of sections comes first, or it would belong to the last one.
std::string Format(const toml::table& document) {
  std::ostringstream text;
  text.exceptions(std::ios::badbit);  // where memory runs out, half a text would pass for a whole
  for (const auto& [name, value] : document) {
    if (!value.is_table()) WriteLine(text, name, value);
  }
  for (const auto& [name, value] : document) {
    const toml::table* section = value.as_table();
    if (section == nullptr) continue;
    text << '[';
    WriteName(text, name);
    text << "]\n";
    for (const auto& [entry, each] : *section) WriteLine(text, entry, each);
  }
  return text.str();
}

}  // namespace

std::optional<CProfileSections> ReadSections(const std::string& text) {
  if (!IsSafeToml(text)) return std::nullopt;
  const toml::parse_result document = toml::parse(text);
  if (document.failed()) return std::nullopt;
  CProfileSections sections;
  for (const auto& [name, node] : document.table()) {
    if (const toml::table* table = node.as_table()) {
      sections.emplace(name.str(), ValuesOf(*table));
    }
  }
  return sections;
}

std::optional<ChangedText> ChangeSection(const std::string& text, const std::string& section,
                                         const CProfileSection& change) {
  ChangedText changed;
  toml::table document = toml::parse(text).table();
  toml::table& table = TableOf(document, section, changed.foreign);
  for (const auto& [entry, value] : change.Changes()) {
    const toml::node* stored = table.get(entry);
    if (changed.foreign.empty() && stored != nullptr && !IsOfKind(*stored, value)) {
      changed.foreign = entry;
    }
    if (value.number) {
      table.insert_or_assign(entry, std::int64_t{*value.number});
    } else {
      table.insert_or_assign(entry, value.text);
    }
  }
  changed.text = Format(document);
  if (!ReadSections(changed.text)) return std::nullopt;
  return changed;
}

}  // namespace platform
