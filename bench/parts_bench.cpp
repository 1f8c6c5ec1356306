// What the game does between two frames, and at its start and its end.

#include <benchmark/benchmark.h>

#include <filesystem>

#include "bench/game.h"
#include "engine/advice.h"
#include "engine/poker.h"
#include "platform/draw/text.h"
#include "platform/store/profile.h"
#include "render/picture_ids.h"
#include "shell/res/pictures.h"
#include "table/command_ids.h"

namespace feltside::bench {
namespace {

/// From the command to the picture of the dealt hands. Each deal is stood on, unmeasured.
void Deal(benchmark::State& state) {
  CGame("PLAYSPEED = 2\n", {}).Run([&state] {
    for (auto _ : state) {
      CGame::Do(kCommandDeal);
      state.PauseTiming();
      CTableState(CGame::View()).Stack({10, 5, 23, 8, 36, 49});
      if (platform::TheApp().MainFrame()->IsCommandEnabled(kCommandStand)) CGame::Do(kCommandStand);
      CTableState(CGame::View()).Stack({10, 5, 23, 8, 36, 49});
      state.ResumeTiming();
    }
  });
}

void Advice(benchmark::State& state) {
  CBlackjackHand hand;
  for (const int card : {1, 5, 20}) hand.AddCard(card);
  std::string text;
  for (auto _ : state) benchmark::DoNotOptimize(GetAdvice(hand, text, 9));
}

void Poker(benchmark::State& state) {
  CCardHand hand;
  hand.SetLimit(5);
  for (const int card : {7, 20, 8, 9, 22}) hand.AddCard(card);
  for (auto _ : state) benchmark::DoNotOptimize(EvaluatePoker(hand));
}

void Shuffle(benchmark::State& state) {
  CGame("", {}).Run([&state] {
    CSixDeckShoe shoe;
    for (auto _ : state) shoe.Shuffle();
  });
}

void Text(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(platform::RenderText({13, false}, "Wallet: $100.00"));
  }
}

void Decode(benchmark::State& state, int number) {
  const platform::CResources pictures(PictureFiles());
  for (auto _ : state) benchmark::DoNotOptimize(pictures.ReadBitmap(number, {}));
}

/// A file as the game leaves it after a while; it goes with this object.
class CProfileFile {
 public:
  CProfileFile();
  ~CProfileFile() { std::filesystem::remove_all(m_file.parent_path()); }
  CProfileFile(const CProfileFile&) = delete;
  CProfileFile& operator=(const CProfileFile&) = delete;

  std::unique_ptr<platform::CProfile> Open() const { return platform::OpenProfile(m_file); }

 private:
  std::filesystem::path m_file =
      std::filesystem::temp_directory_path() / "feltside-bench-profile" / "p.toml";
};

CProfileFile::CProfileFile() {
  Open()->Update("Settings", [](platform::CProfileSection& section) {
    for (const char* name : {"GAME_TYPE", "USEHIGH", "FANCYVP", "FANCYBJ", "CARDBACK", "TABLECOLOR",
                             "BOXCOLOR", "VIDEODISCARDS", "STRATTYPE", "NUMDECKS", "PLAYSPEED"}) {
      section.Set(name, 1);
    }
    for (int i = 0; i < 5; ++i) section.Set("High" + std::to_string(i), "A Name 500");
  });
}

void StartProfile(benchmark::State& state) {
  const CProfileFile file;
  for (auto _ : state) benchmark::DoNotOptimize(file.Open()->Read());
}

void StoreDialog(benchmark::State& state) {
  const CProfileFile file;
  const auto profile = file.Open();
  for (auto _ : state) {
    profile->Update("Settings", [](platform::CProfileSection& section) {
      for (const char* name : {"TABLECOLOR", "BOXCOLOR", "CARDBACK", "VIDEODISCARDS", "FANCYVP",
                               "FANCYBJ", "USEHIGH"}) {
        section.Set(name, 1);
      }
    });
  }
}

}  // namespace

void RegisterParts() {
  benchmark::RegisterBenchmark("a deal, with its frames", Deal);
  benchmark::RegisterBenchmark("an answer of the adviser", Advice);
  benchmark::RegisterBenchmark("a poker evaluation", Poker);
  benchmark::RegisterBenchmark("a shuffle of six decks", Shuffle);
  benchmark::RegisterBenchmark("a text", Text);
  benchmark::RegisterBenchmark("decoding a card", Decode, 1);
  benchmark::RegisterBenchmark("decoding the table", Decode, IDB_TABLE);
  benchmark::RegisterBenchmark("a start of the profile", StartProfile);
  benchmark::RegisterBenchmark("a store of a dialog", StoreDialog)->UseRealTime();
}

}  // namespace feltside::bench
