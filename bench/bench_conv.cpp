// Convolution: the direct sums against the FFT method at growing equal
// lengths (read the crossover where BM_ConvolveFft/N drops below
// BM_ConvolveDirect/N), and with one short operand. 2-D FFT against FFTW's
// 2-D transforms (FFTW_MEASURE plans made outside the timing); read
// BM_Fft2D*/R/C over BM_Fftw2D*/R/C as the ratio. Our real 2-D transform
// writes the full Hermitian spectrum, FFTW's r2c only its half.
#include <benchmark/benchmark.h>
#include <fftw3.h>

#include <algorithm>
#include <vector>

#include "fftw_timing.h"
#include "frame/types.h"
#include "timedomain/convolution.h"
#include "transforms/fft2d.h"
#include "transforms/plan_ref.h"

namespace {

using tsmbench::Noise;

void Convolve(benchmark::State& state, int32_t algorithm) {
  const int n = static_cast<int>(state.range(0)), m = static_cast<int>(state.range(1));
  const std::vector<double> x = Noise(n, 1), y = Noise(m, 2);
  std::vector<double> out(n + m - 1);
  const tsm::PlanRef hold(tsm::kwfft_next_smooth_length(n + m - 1));  // as a node would
  for (auto _ : state) {
    tsm::Convolve(x.data(), n, y.data(), m, algorithm, out.data());
    benchmark::DoNotOptimize(out.data());
  }
}
void BM_ConvolveDirect(benchmark::State& state) { Convolve(state, tsm::kConvolveDirect); }
void BM_ConvolveFft(benchmark::State& state) { Convolve(state, tsm::kConvolveFft); }

void ConvolutionArgs(benchmark::internal::Benchmark* b) {
  for (int n : {8, 16, 32, 64, 128, 256, 512, 1024, 4096}) b->Args({n, n});
  for (int n : {256, 1024, 4096, 16384, 65536}) b->Args({n, 32});
}
BENCHMARK(BM_ConvolveDirect)->Apply(ConvolutionArgs);
BENCHMARK(BM_ConvolveFft)->Apply(ConvolutionArgs);

const std::vector<std::pair<int, int>> kShapes = {{64, 64}, {256, 256}, {512, 512}, {100, 120}, {97, 101}, {480, 640}};

void Shapes(benchmark::internal::Benchmark* b) {
  for (auto [r, c] : kShapes) b->Args({r, c});
}

void BM_Fft2DReal(benchmark::State& state) {
  const int R = static_cast<int>(state.range(0)), C = static_cast<int>(state.range(1));
  const tsm::PlanRef pc(C), pr(R);
  const std::vector<double> x = Noise(size_t(R) * C, 3);
  std::vector<tsm::cx> X(size_t(R) * C);
  for (auto _ : state) {
    tsm::ReFft2D(pc.get(), pr.get(), x.data(), R, C, 0, 0, R, C, 0, X.data());
    benchmark::DoNotOptimize(X.data());
  }
}

void BM_Fftw2DReal(benchmark::State& state) {
  const int R = static_cast<int>(state.range(0)), C = static_cast<int>(state.range(1));
  double* x = fftw_alloc_real(size_t(R) * C);
  fftw_complex* X = fftw_alloc_complex(size_t(R) * (C / 2 + 1));
  fftw_plan p = fftw_plan_dft_r2c_2d(R, C, x, X, FFTW_MEASURE);
  const std::vector<double> v = Noise(size_t(R) * C, 3);
  std::copy(v.begin(), v.end(), x);
  tsmbench::TimeFftwPlan(state, p, {x, X});
}

void BM_Fft2DComplex(benchmark::State& state) {
  const int R = static_cast<int>(state.range(0)), C = static_cast<int>(state.range(1));
  const tsm::PlanRef pc(C), pr(R);
  const std::vector<double> v = Noise(2 * size_t(R) * C, 4);
  std::vector<tsm::cx> x(size_t(R) * C), X(size_t(R) * C);
  for (size_t i = 0; i < x.size(); ++i) x[i] = tsm::cx{v[2 * i], v[2 * i + 1]};
  for (auto _ : state) {
    tsm::CxFft2D(pc.get(), pr.get(), x.data(), R, C, 0, 0, R, C, 0, X.data());
    benchmark::DoNotOptimize(X.data());
  }
}

void BM_Fftw2DComplex(benchmark::State& state) {
  const int R = static_cast<int>(state.range(0)), C = static_cast<int>(state.range(1));
  fftw_complex* x = fftw_alloc_complex(size_t(R) * C);
  fftw_complex* X = fftw_alloc_complex(size_t(R) * C);
  fftw_plan p = fftw_plan_dft_2d(R, C, x, X, FFTW_FORWARD, FFTW_MEASURE);
  const std::vector<double> v = Noise(2 * size_t(R) * C, 4);
  for (size_t i = 0; i < size_t(R) * C; ++i) x[i][0] = v[2 * i], x[i][1] = v[2 * i + 1];
  tsmbench::TimeFftwPlan(state, p, {x, X});
}

BENCHMARK(BM_Fft2DReal)->Apply(Shapes);
BENCHMARK(BM_Fftw2DReal)->Apply(Shapes);
BENCHMARK(BM_Fft2DComplex)->Apply(Shapes);
BENCHMARK(BM_Fftw2DComplex)->Apply(Shapes);

}  // namespace
