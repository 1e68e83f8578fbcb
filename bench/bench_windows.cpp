// The window kernels against a direct per-sample evaluation: the cosine-sum
// kernel (one rotation step per coefficient and sample pair) against cos per
// coefficient and sample, and the Kaiser kernel (pairs, one series per pair)
// against the I0 series per sample. Read BM_<Kernel>/N over BM_Direct<...>/N
// as the ratio (ours / direct).
#include <benchmark/benchmark.h>

#include <cmath>
#include <vector>

#include "windows/cosine_sum.h"
#include "windows/special_windows.h"

namespace {

constexpr double kPi = 3.141592653589793;
const std::vector<double> kBlackmanHarris4 = {0.35875, 0.48829, 0.14128, 0.01168};
constexpr double kBeta = 8.6;

void SetItems(benchmark::State& state, int n) {
  state.SetItemsProcessed(state.iterations() * n);
  state.counters["n"] = n;
}

void BM_CosineSum(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  std::vector<double> x(n, 1.0);
  for (auto _ : state) {
    tsm::CosineSumWindow(x.data(), n, kBlackmanHarris4.data(), 4, false);
    benchmark::DoNotOptimize(x.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

void BM_DirectCosineSum(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  std::vector<double> x(n, 1.0);
  const int m = static_cast<int>(kBlackmanHarris4.size());
  for (auto _ : state) {
    for (int i = 0; i < n; ++i) {
      double w = 0, sign = 1;
      for (int k = 0; k < m; ++k, sign = -sign) w += sign * kBlackmanHarris4[k] * std::cos(2 * kPi * k * i / n);
      x[i] *= w;
    }
    benchmark::DoNotOptimize(x.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

void BM_Kaiser(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  std::vector<double> x(n, 1.0);
  for (auto _ : state) {
    tsm::KaiserWindow(x.data(), n, kBeta);
    benchmark::DoNotOptimize(x.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

void BM_DirectKaiser(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  std::vector<double> x(n, 1.0);
  for (auto _ : state) {
    const double den = tsm::BesselI0Series(kBeta);
    for (int i = 0; i < n; ++i) {
      const double t = 1.0 - 2.0 * i / n;
      x[i] *= tsm::BesselI0Series(kBeta * std::sqrt(1.0 - t * t)) / den;
    }
    benchmark::DoNotOptimize(x.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

}  // namespace

BENCHMARK(BM_CosineSum)->Arg(256)->Arg(4096)->Arg(65536);
BENCHMARK(BM_DirectCosineSum)->Arg(256)->Arg(4096)->Arg(65536);
BENCHMARK(BM_Kaiser)->Arg(256)->Arg(4096)->Arg(65536);
BENCHMARK(BM_DirectKaiser)->Arg(256)->Arg(4096)->Arg(65536);
