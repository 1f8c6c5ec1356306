// A whole frame of each phase, beside the same frame drawn straight on SDL's surfaces.

#include <benchmark/benchmark.h>

#include "bench/game.h"
#include "bench/phases.h"
#include "bench/sdl_frame.h"

namespace feltside::bench {
namespace {

platform::CBitmap TableShown() {
  const platform::CBitmap& whole = CGame::View().TopLevel().Pixels();
  platform::CBitmap table({240, 268});
  platform::CSurface(table).BitBlt({}, table.GetSize(), whole, {0, 26});
  return table;
}

void GameFrame(benchmark::State& state, const Phase& phase) {
  CGame(phase.settings, phase.lines).Run([&] {
    const CSdlFrame other(phase);
    other.Draw();
    if (other.Shown() != TableShown()) {
      platform::SavePng(other.Shown(), phase.name + ".sdl.png");
      platform::SavePng(TableShown(), phase.name + ".game.png");
      state.SkipWithError("the two draw different pictures");
    }
    for (auto _ : state) {
      CGame::View().Invalidate();
      CGame::View().UpdateWindow();
    }
  });
}

void SdlFrame(benchmark::State& state, const Phase& phase) {
  const CSdlFrame frame(phase);
  for (auto _ : state) frame.Draw();
}

}  // namespace

void RegisterFrames() {
  for (const Phase& phase : Phases()) {
    benchmark::RegisterBenchmark(("frame, " + phase.name).c_str(), GameFrame, phase);
    benchmark::RegisterBenchmark(("the same on SDL, " + phase.name).c_str(), SdlFrame, phase);
  }
}

}  // namespace feltside::bench
