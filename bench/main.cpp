// Measures the game's parts; what they are measured against stands beside them.

#include <benchmark/benchmark.h>

namespace feltside::bench {
void RegisterFrames();
void RegisterParts();
}  // namespace feltside::bench

int main(int argc, char** argv) {
  feltside::bench::RegisterFrames();
  feltside::bench::RegisterParts();
  benchmark::Initialize(&argc, argv);
  benchmark::RunSpecifiedBenchmarks();
  return 0;
}
