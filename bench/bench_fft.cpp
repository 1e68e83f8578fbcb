// The FFT engine against FFTW in the same process: complex (split arrays on
// both sides, FFTW's guru split interface) and real (our HalfComplex against
// FFTW's r2c). FFTW plans are made with FFTW_MEASURE outside the timing.
// Read BM_Kwfft*/N over BM_Fftw*/N as the ratio.
#include <benchmark/benchmark.h>
#include <fftw3.h>

#include <algorithm>
#include <vector>

#include "fftw_timing.h"
#include "transforms/kwfft.h"
#include "transforms/plan_ref.h"

namespace {

using tsmbench::Noise;

const std::vector<int64_t> kLengths = {64, 256, 1000, 1024, 4096, 44100, 48000, 65536, 1 << 20, 1009, 4099, 10007};

void SetItems(benchmark::State& state, int n) {
  state.SetItemsProcessed(state.iterations() * n);
  state.counters["n"] = n;
}

void BM_KwfftComplex(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  const tsm::PlanRef plan(n);
  std::vector<double> xr = Noise(n, 1), xi = Noise(n, 2), yr(n), yi(n);
  for (auto _ : state) {
    tsm::kwfft_complex(plan.get(), xr.data(), xi.data(), yr.data(), yi.data(), 1, 1, n);
    benchmark::DoNotOptimize(yr.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

void BM_FftwComplex(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  double* xr = fftw_alloc_real(n);
  double* xi = fftw_alloc_real(n);
  double* yr = fftw_alloc_real(n);
  double* yi = fftw_alloc_real(n);
  fftw_iodim dim{n, 1, 1};
  fftw_plan p = fftw_plan_guru_split_dft(1, &dim, 0, nullptr, xr, xi, yr, yi, FFTW_MEASURE);
  const std::vector<double> a = Noise(n, 1), b = Noise(n, 2);
  std::copy(a.begin(), a.end(), xr);
  std::copy(b.begin(), b.end(), xi);
  tsmbench::TimeFftwPlan(state, p, {xr, xi, yr, yi});
  SetItems(state, n);
}

void BM_KwfftReal(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  const tsm::PlanRef plan(n);
  std::vector<double> x = Noise(n, 3), y(n);
  for (auto _ : state) {
    tsm::kwfft_real(plan.get(), x.data(), y.data(), 1, 1, n);
    benchmark::DoNotOptimize(y.data());
    benchmark::ClobberMemory();
  }
  SetItems(state, n);
}

void BM_FftwReal(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  double* x = fftw_alloc_real(n);
  fftw_complex* y = fftw_alloc_complex(n / 2 + 1);
  fftw_plan p = fftw_plan_dft_r2c_1d(n, x, y, FFTW_MEASURE);
  const std::vector<double> a = Noise(n, 3);
  std::copy(a.begin(), a.end(), x);
  tsmbench::TimeFftwPlan(state, p, {x, y});
  SetItems(state, n);
}

void Lengths(benchmark::internal::Benchmark* b) {
  for (int64_t n : kLengths) b->Arg(n);
}

BENCHMARK(BM_KwfftComplex)->Apply(Lengths);
BENCHMARK(BM_FftwComplex)->Apply(Lengths);
BENCHMARK(BM_KwfftReal)->Apply(Lengths);
BENCHMARK(BM_FftwReal)->Apply(Lengths);

}  // namespace
