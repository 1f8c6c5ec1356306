#include "tests/support/scenes.h"

#include <algorithm>
#include <fstream>
#include <stdexcept>

#include "platform/draw/surface.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

const Scene& Named(const std::vector<Scene>& scenes, const std::string& name) {
  const auto found = std::find_if(scenes.begin(), scenes.end(),
                                  [&name](const Scene& scene) { return scene.name == name; });
  if (found == scenes.end()) throw std::runtime_error("no scene " + name);
  return *found;
}

void AddLine(Scene& scene, const std::string& word, const std::string& rest) {
  if (word == "settings") {
    for (const std::string& setting : SplitAt("; ", rest)) scene.settings += setting + "\n";
  } else if (word == "reads") {
    scene.reads = SplitAt("; ", rest);
  } else if (word == "golden") {
    scene.golden = true;
  } else if (word != "album" && word != "help-picture") {
    scene.commands.push_back(rest.empty() ? word : word + " " + rest);
  }
}

std::vector<Scene> ReadScenes() {
  std::vector<Scene> scenes;
  std::ifstream file(FELTSIDE_SCENES);
  for (std::string line; std::getline(file, line);) {
    const std::string word = line.substr(0, line.find(' '));
    const std::string rest = line.substr(std::min(line.size(), word.size() + 1));
    if (word == "==") {
      scenes.push_back({rest});
    } else if (word == "from") {
      const Scene& other = Named(scenes, rest);
      scenes.back().settings += other.settings;
      scenes.back().commands.insert(scenes.back().commands.end(), other.commands.begin(),
                                    other.commands.end());
    } else if (!line.empty() && line[0] != ';' && word != "chapter") {
      AddLine(scenes.back(), word, rest);
    }
  }
  return scenes;
}

}  // namespace

const std::vector<Scene>& Scenes() {
  static const std::vector<Scene> scenes = ReadScenes();
  return scenes;
}

std::unique_ptr<Stylus> Play(const Scene& scene) {
  auto stylus = std::make_unique<Stylus>("[Settings]\n" + scene.settings);
  for (const std::string& command : scene.commands) Do(*stylus, command);
  return stylus;
}

std::unique_ptr<Stylus> Play(const std::string& name) { return Play(Named(Scenes(), name)); }

platform::CBitmap TableOf(const platform::CBitmap& shot) {
  const platform::Size size{240, 268};
  platform::CBitmap table(size);
  platform::CSurface(table).BitBlt({}, size, shot, {0, shot.GetSize().height - size.height});
  return table;
}

}  // namespace feltside::tests
