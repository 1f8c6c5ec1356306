#pragma once

#include <memory>
#include <string>
#include <vector>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// A screen of the game, as tools/scenes.txt says how it comes about.
struct Scene {
  std::string name;
  std::string settings = {};  ///< lines of the settings' file
  std::vector<std::string> commands = {};
  std::vector<std::string> reads = {};  ///< texts besides those that every such screen shows
  bool golden = false;                  ///< a picture of it is kept
};

/// All of them, in their order.
const std::vector<Scene>& Scenes();

/// The program at the end of a scene; fails the test where a command is refused.
std::unique_ptr<Stylus> Play(const Scene& scene);
std::unique_ptr<Stylus> Play(const std::string& name);

/// The table's part of a picture of the window.
platform::CBitmap TableOf(const platform::CBitmap& shot);

}  // namespace feltside::tests
