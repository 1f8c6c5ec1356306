#include "platform/window/narrator.h"

#include <algorithm>
#include <utility>

#include "platform/host/host.h"
#include "platform/window/top_window.h"

namespace platform {
namespace {

/// What stands in the one list and not in the other. What stands there twice was told twice.
Phrases NewIn(const Phrases& now, Phrases before) {
  Phrases fresh;
  for (const std::string& phrase : now) {
    const auto told = std::find(before.begin(), before.end(), phrase);
    if (told == before.end()) {
      fresh.push_back(phrase);
    } else {
      before.erase(told);
    }
  }
  return fresh;
}

/// A phrase as a sentence, without blanks around it.
std::string Sentence(const std::string& phrase) {
  const std::size_t first = phrase.find_first_not_of(' ');
  if (first == std::string::npos) return {};
  const std::string text = phrase.substr(first, phrase.find_last_not_of(' ') + 1 - first);
  return std::string(".!?").find(text.back()) == std::string::npos ? text + "." : text;
}

}  // namespace

void CNarrator::TellOf(const CTopWindow& window) {
  if (!TheHost().HasVoice()) return;
  const Phrases now = window.Words();
  Phrases told = NewIn(now, std::exchange(m_arrTold, now));
  if (told.empty()) return;
  if (told.back() != now.back()) told.push_back(now.back());
  std::string text;
  for (const std::string& phrase : told) {
    const std::string sentence = Sentence(phrase);
    text += (text.empty() || sentence.empty() ? "" : " ") + sentence;
  }
  TheHost().Say(text);
}

}  // namespace platform
