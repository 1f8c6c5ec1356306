// What the clipboard brings into an edit.

#include <gtest/gtest.h>

#include "tests/support/desk.h"

namespace feltside::tests {
namespace {

TEST(EditBox, MakesOneLineOfLettersOfAPaste) {
  const std::vector<std::pair<std::string, std::string>> cases = {
      {"one\r\ntwo\nthree\tfour", "one two three four"},
      {"o\xFFk\xC3\xE2\x82\xAC\xF0\x9F", "ok\u20AC"},
      {"\" \\ = [x]", "\" \\ = [x]"},
      {std::string(100000, 'm'), std::string(100000, 'm')}};
  Desk desk;
  desk.Table().SetWallet(250);
  desk.Command(platform::kCommandExit);
  for (const auto& [pasted, text] : cases) {
    desk.Host().SetClipboard(pasted);
    for (const char* key : {"Ctrl+A", "Ctrl+V"}) desk.Host().PutKey(key);
    desk.Run();
    EXPECT_EQ(desk.Dialog()->GetDlgItem(6016)->GetText(), text);
  }
}

}  // namespace
}  // namespace feltside::tests
