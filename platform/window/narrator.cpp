#include "platform/window/narrator.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/host/host.h"
#include "platform/window/top_window.h"

namespace platform {
namespace {

Phrases NewIn(const Phrases& now, const Phrases& before) {
  Phrases fresh;
  std::copy_if(now.begin(), now.end(), std::back_inserter(fresh), [&](const std::string& phrase) {
    return !phrase.empty() && std::find(before.begin(), before.end(), phrase) == before.end();
  });
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
