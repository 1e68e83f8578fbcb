// PulseMeasEx on 10^6 samples (1000 noisy trapezoid periods, the last full
// pulse measured, levels from a 100-bin histogram), reported in samples per
// second, beside a bare minimum-and-maximum pass over the same samples: the
// ratio of the two is what the measurement costs in passes over the data.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <random>
#include <vector>

#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace {

constexpr int kSamples = 1000000;
constexpr int kPeriod = 1000;
constexpr int kPulse = kSamples / kPeriod - 1;

std::vector<double> Train() {
  std::mt19937_64 gen(20261123);
  std::uniform_real_distribution<double> noise(-0.01, 0.01);
  std::vector<double> x(kSamples);
  for (int i = 0; i < kSamples; ++i) {
    const int u = i % kPeriod;
    const double v = u < 100 ? 0 : u < 150 ? (u - 100) / 50.0 : u < 500 ? 1 : u < 550 ? 1 - (u - 500) / 50.0 : 0;
    x[i] = v + noise(gen);
  }
  return x;
}

void BM_PulseMeasEx(benchmark::State& state) {
  const std::vector<double> x = Train();
  auto h = static_cast<F64ArrayHdl>(tsrt_new_array(TSM_TYPE_F64, kSamples, x.data()));
  const ReferenceLevels refs{90, 50, 10, 1};
  const LevelMethod how{0, 100};
  HistogramBuffer* hist = nullptr;
  double out[7];
  for (auto _ : state) {
    const int32_t e = PulseMeasEx(h, 0, 1e-6, 1, 0, kPulse, &refs, &how, &hist, out, out + 1, out + 2, out + 3,
                                  out + 4, out + 5, out + 6, 0);
    if (e != 0) state.SkipWithError("PulseMeasEx failed");
    benchmark::DoNotOptimize(out);
  }
  state.SetItemsProcessed(state.iterations() * kSamples);
  tsrt_end_run();
  tsrt_dispose(h);
}
BENCHMARK(BM_PulseMeasEx)->Unit(benchmark::kMillisecond);

void BM_MinMaxPass(benchmark::State& state) {
  const std::vector<double> x = Train();
  for (auto _ : state) {
    auto mm = std::minmax_element(x.begin(), x.end());
    benchmark::DoNotOptimize(mm);
  }
  state.SetItemsProcessed(state.iterations() * kSamples);
}
BENCHMARK(BM_MinMaxPass)->Unit(benchmark::kMillisecond);

}  // namespace
