// Special-function kernels against the C library's tgamma, lgamma, erf, erfc
// and jn on the same arguments, in the same run. Read calls per second
// (items_per_second) of BM_Ours_<f> over BM_Libc_<f>; IncompleteBeta and
// Bessel J of non-integer order have no libc peer and are reported alone.
#include <benchmark/benchmark.h>

#include <cmath>
#include <random>
#include <vector>

#include "special/bessel_jy.h"
#include "special/beta.h"
#include "special/erf.h"
#include "special/gamma.h"

namespace {

constexpr int kPoints = 4096;

std::vector<double> Uniform(double lo, double hi, unsigned seed) {
  std::mt19937_64 gen(seed);
  std::uniform_real_distribution<double> d(lo, hi);
  std::vector<double> v(kPoints);
  for (auto& x : v) x = d(gen);
  return v;
}

template <double (*F)(double)>
void Run(benchmark::State& state, const std::vector<double>& xs) {
  for (auto _ : state) {
    double sum = 0;
    for (double x : xs) sum += F(x);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kPoints);
}

double LibcTgamma(double x) { return std::tgamma(x); }
double LibcLgamma(double x) { return std::lgamma(x); }
double LibcErf(double x) { return std::erf(x); }
double LibcErfc(double x) { return std::erfc(x); }

const std::vector<double> kGammaArgs = Uniform(0.1, 30, 1);
const std::vector<double> kLogGammaArgs = Uniform(0.1, 1000, 2);
const std::vector<double> kErfArgs = Uniform(-3, 3, 3);
const std::vector<double> kErfcArgs = Uniform(-3, 10, 4);

void BM_Ours_Gamma(benchmark::State& s) { Run<tsm::GammaFn>(s, kGammaArgs); }
void BM_Libc_Gamma(benchmark::State& s) { Run<LibcTgamma>(s, kGammaArgs); }
void BM_Ours_LogGamma(benchmark::State& s) { Run<tsm::LogGamma>(s, kLogGammaArgs); }
void BM_Libc_LogGamma(benchmark::State& s) { Run<LibcLgamma>(s, kLogGammaArgs); }
void BM_Ours_Erf(benchmark::State& s) { Run<tsm::ErrorFn>(s, kErfArgs); }
void BM_Libc_Erf(benchmark::State& s) { Run<LibcErf>(s, kErfArgs); }
void BM_Ours_Erfc(benchmark::State& s) { Run<tsm::ErrorFnC>(s, kErfcArgs); }
void BM_Libc_Erfc(benchmark::State& s) { Run<LibcErfc>(s, kErfcArgs); }

void BM_Ours_IncompleteBeta(benchmark::State& state) {
  const std::vector<double> a = Uniform(0.5, 20, 5), b = Uniform(0.5, 20, 6), x = Uniform(0, 1, 7);
  for (auto _ : state) {
    double sum = 0;
    for (int i = 0; i < kPoints; ++i) sum += tsm::IncompleteBeta(a[i], b[i], x[i]);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kPoints);
}

// Bessel J of integer order n (the benchmark's argument) over x in (0, 50).
const std::vector<double> kBesselArgs = Uniform(0, 50, 8);

void BM_Ours_BesselJn(benchmark::State& state) {
  const double n = static_cast<double>(state.range(0));
  for (auto _ : state) {
    double sum = 0;
    for (double x : kBesselArgs) sum += tsm::BesselJ(n, x);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kPoints);
}

void BM_Libc_BesselJn(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  for (auto _ : state) {
    double sum = 0;
    for (double x : kBesselArgs) sum += jn(n, x);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kPoints);
}

void BM_Ours_BesselJv(benchmark::State& state) {
  const std::vector<double> v = Uniform(-10, 30, 9);
  for (auto _ : state) {
    double sum = 0;
    for (int i = 0; i < kPoints; ++i) sum += tsm::BesselJ(v[i], kBesselArgs[i]);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kPoints);
}

BENCHMARK(BM_Ours_Gamma);
BENCHMARK(BM_Libc_Gamma);
BENCHMARK(BM_Ours_LogGamma);
BENCHMARK(BM_Libc_LogGamma);
BENCHMARK(BM_Ours_Erf);
BENCHMARK(BM_Libc_Erf);
BENCHMARK(BM_Ours_Erfc);
BENCHMARK(BM_Libc_Erfc);
BENCHMARK(BM_Ours_IncompleteBeta);
BENCHMARK(BM_Ours_BesselJn)->Arg(0)->Arg(1)->Arg(5)->Arg(20);
BENCHMARK(BM_Libc_BesselJn)->Arg(0)->Arg(1)->Arg(5)->Arg(20);
BENCHMARK(BM_Ours_BesselJv);

}  // namespace
