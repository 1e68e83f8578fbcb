// The cosine and sine transforms against FFTW's r2r kinds in the same
// process: our orthonormal type II DCT against REDFT10 and our type I DST
// against RODFT00 (FFTW's are unscaled, ours include the scale and the
// scratch each call takes). Plans are made outside the timing, FFTW's with
// FFTW_MEASURE. Read BM_Trig*/N over BM_Fftw*/N as the ratio.
#include <benchmark/benchmark.h>
#include <fftw3.h>

#include <algorithm>
#include <vector>

#include "fftw_timing.h"
#include "transforms/dct.h"
#include "transforms/plan_ref.h"

namespace {

const std::vector<int64_t> kLengths = {64, 255, 1000, 1024, 4096, 9973, 65536};

void Ours(benchmark::State& state, tsm::TrigKind kind) {
  const int n = static_cast<int>(state.range(0));
  const tsm::PlanRef plan(static_cast<tsm::int32>(tsm::TrigPlanLength(kind, n)));
  const std::vector<double> x = tsmbench::Noise(n, 7);
  std::vector<double> y(n);
  for (auto _ : state) {
    tsm::TrigTransform(kind, plan.get(), x.data(), n, y.data(), n);
    benchmark::DoNotOptimize(y.data());
    benchmark::ClobberMemory();
  }
  state.SetItemsProcessed(state.iterations() * n);
}

void Fftw(benchmark::State& state, fftw_r2r_kind kind) {
  const int n = static_cast<int>(state.range(0));
  double* x = fftw_alloc_real(n);
  double* y = fftw_alloc_real(n);
  fftw_plan p = fftw_plan_r2r_1d(n, x, y, kind, FFTW_MEASURE);
  const std::vector<double> a = tsmbench::Noise(n, 7);
  std::copy(a.begin(), a.end(), x);
  tsmbench::TimeFftwPlan(state, p, {x, y});
  state.SetItemsProcessed(state.iterations() * n);
}

void BM_TrigDct(benchmark::State& state) { Ours(state, tsm::TrigKind::kDct); }
void BM_FftwDct(benchmark::State& state) { Fftw(state, FFTW_REDFT10); }
void BM_TrigDst(benchmark::State& state) { Ours(state, tsm::TrigKind::kDst); }
void BM_FftwDst(benchmark::State& state) { Fftw(state, FFTW_RODFT00); }

BENCHMARK(BM_TrigDct)->ArgsProduct({kLengths});
BENCHMARK(BM_FftwDct)->ArgsProduct({kLengths});
BENCHMARK(BM_TrigDst)->ArgsProduct({kLengths});
BENCHMARK(BM_FftwDst)->ArgsProduct({kLengths});

}  // namespace
