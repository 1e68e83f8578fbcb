// The sine generator's recurrence (SineWave) against the loop a user would
// write, amp*sin(ph + w*i) per sample. Read BM_SineWave/N over BM_DirectSine/N.
#include <benchmark/benchmark.h>

#include <cmath>
#include <vector>

#include "generate/waveforms.h"

namespace {

constexpr double kAmp = 1.5, kFreq = 0.0123, kPhase = 30;

void BM_SineWave(benchmark::State& state) {
  std::vector<double> y(state.range(0));
  for (auto _ : state) {
    double phase = kPhase;
    tsm::SineWave(y.data(), static_cast<int>(y.size()), kAmp, kFreq, &phase);
    benchmark::DoNotOptimize(y.data());
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_DirectSine(benchmark::State& state) {
  std::vector<double> y(state.range(0));
  for (auto _ : state) {
    const double ph = kPhase * 0.017453292519943295, w = 2 * M_PI * kFreq;
    for (size_t i = 0; i < y.size(); ++i) y[i] = kAmp * std::sin(ph + w * static_cast<double>(i));
    benchmark::DoNotOptimize(y.data());
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

BENCHMARK(BM_SineWave)->Arg(1000)->Arg(100000);
BENCHMARK(BM_DirectSine)->Arg(1000)->Arg(100000);

}  // namespace
