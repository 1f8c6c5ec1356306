#include "platform/store/toml_check.h"

#include <algorithm>
#include <string>

namespace platform {
namespace {

constexpr std::size_t kMostDots = 32;    ///< in one key
constexpr std::size_t kMostNested = 64;  ///< arrays and inline tables in one another
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::string_view kValueEnds = " \t\r\n,]}#";
constexpr std::size_t kNowhere = std::string_view::npos;

bool IsAscii(char c) { return static_cast<unsigned char>(c) < 0x80; }

bool Contains(std::string_view set, char c) { return set.find(c) != kNowhere; }

/// The place behind a backslash in a string and what it stands for. Behind one at the end of a line
/// that is the next letter further down, which the parser looks at before it takes it as a text.
std::size_t EndOfEscape(std::string_view text, std::size_t backslash) {
  const std::size_t next = text.find_first_not_of(" \t\r\n", backslash + 1);
  if (next == kNowhere || !IsAscii(text[next])) return kNowhere;
  return next == backslash + 1 ? next + 1 : next;
}

/// The place behind a string; nowhere, where it does not end or is not safe.
std::size_t EndOfString(std::string_view text, std::size_t begin) {
  const char quote = text[begin];
  const std::string threeQuotes(3, quote);
  const bool multiLine = text.substr(begin, 3) == threeQuotes;
  const std::string_view mark = std::string_view(threeQuotes).substr(0, multiLine ? 3 : 1);
  std::size_t at = begin + mark.size();
  while (at < text.size() && text.substr(at, mark.size()) != mark) {
    if (text[at] == '\n' && !multiLine) return kNowhere;
    at = text[at] == '\\' && quote == '"' ? EndOfEscape(text, at) : at + 1;
  }
  if (at >= text.size()) return kNowhere;
  at += mark.size();
  // Of five quotes at the end of a text of several lines, the first two belong to it.
  for (int more = 0; more < 2 && multiLine && at < text.size() && text[at] == quote; ++more) ++at;
  return at;
}

/// Whether a blank and a single digit follow a value, which is never right. Behind a date the
/// parser takes them for a time, and runs over the end of the line.
bool HasLoneDigitBehind(std::string_view text, std::size_t end) {
  const std::string_view behind = end < text.size() ? text.substr(end, 3) : "";
  return behind.size() == 3 && behind[0] == ' ' && Contains("0123456789", behind[1]) &&
         Contains(kValueEnds, behind[2]);
}

/// Goes through a text as the parser does, but only so far as to know where a key is expected and
/// where a value, since a quotation mark in the midst of a value begins no string.
class CTomlScan {
 public:
  explicit CTomlScan(std::string_view text) : m_strText(text) {}

  bool IsSafe() {
    if (m_strText.substr(0, kByteOrderMark.size()) == kByteOrderMark) m_nAt = kByteOrderMark.size();
    while (m_nAt < m_strText.size()) {
      if (!Step() || m_nDots > kMostDots || m_strOpen.size() > kMostNested) return false;
    }
    return true;
  }

 private:
  /// Passes over a comment, a string, a value without quotation marks or a single letter.
  bool Step() {
    const char c = m_strText[m_nAt];
    if (c == '#') {
      m_nAt = m_strText.find('\n', m_nAt);
    } else if (Contains("\"'", c)) {
      m_nAt = EndOfString(m_strText, m_nAt);
      return m_nAt != kNowhere;
    } else if (m_bValue && !Contains(" \t\r\n,[]{}=", c)) {
      const std::size_t end = m_strText.find_first_of(kValueEnds, m_nAt);
      const std::string_view value = m_strText.substr(m_nAt, end - m_nAt);
      m_nAt = end;
      return std::all_of(value.begin(), value.end(), IsAscii) &&
             !HasLoneDigitBehind(m_strText, end);
    } else {
      Pass(c);
      ++m_nAt;
      return IsAscii(c);
    }
    return true;
  }

  void Pass(char c) {
    m_nDots = c == '.' ? m_nDots + 1 : Contains("\n=,[{", c) ? 0 : m_nDots;
    if (c == '{' || (c == '[' && m_bValue)) m_strOpen += c;
    if (c == '}' || c == ']') m_strOpen.resize(m_strOpen.empty() ? 0 : m_strOpen.size() - 1);
    const bool inArray = !m_strOpen.empty() && m_strOpen.back() == '[';
    if (c == '=') m_bValue = true;
    if (Contains("{},[]\n", c)) m_bValue = inArray;
  }

  std::string_view m_strText;
  std::size_t m_nAt = 0;
  std::size_t m_nDots = 0;
  bool m_bValue = false;
  std::string m_strOpen;  ///< the brackets of arrays and inline tables that are not closed yet
};

}  // namespace

bool IsSafeToml(std::string_view text) { return CTomlScan(text).IsSafe(); }

}  // namespace platform
