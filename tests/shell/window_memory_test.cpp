// The window opens where it was left, and its place is stored only when it is another one.

#include <gtest/gtest.h>

#include "platform/host/host.h"
#include "tests/support/desk.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

using platform::WindowPlace;

/// Closes the game and returns what its settings' file then holds.
std::string FileAfter(Desk& desk) {
  const auto file = desk.Host().ProfileFolder() / "Quillworks" / "Feltside.toml";
  desk.Host().PutPointer(platform::InputKind::kClose, {});
  EXPECT_FALSE(desk.Run());
  return ReadFile(file);
}

TEST(WindowMemory, KeepsWhereTheWindowWasLeft) {
  const std::string stored = "Window = {LEFT=-10, TOP=20, RIGHT=400, BOTTOM=500, MAXIMIZED=1}";
  const WindowPlace left{{5, 6, 245, 300}, false};
  Desk unmoved(stored);
  EXPECT_EQ(unmoved.Host().GetWindowPlace(), (WindowPlace{{-10, 20, 400, 500}, true}));
  EXPECT_EQ(FileAfter(unmoved), stored);
  Desk moved(stored);
  moved.Host().SetWindowPlace(left);
  Desk again(FileAfter(moved));
  EXPECT_EQ(again.Host().GetWindowPlace(), left);
}

TEST(WindowMemory, HasNoPlaceWithoutAWholeOne) {
  for (const char* stored :
       {"", "Window = {LEFT=1, TOP=2, RIGHT=300}", "Window = {LEFT=9, TOP=2, RIGHT=8, BOTTOM=400}",
        "Window = {LEFT=1, TOP=2, RIGHT=2000000000, BOTTOM=400}"}) {
    Desk desk(stored);
    EXPECT_FALSE(desk.Host().GetWindowPlace()) << stored;
    EXPECT_EQ(FileAfter(desk), stored);
  }
}

}  // namespace
}  // namespace feltside::tests
