// tsdemo: acts as a host. It links the reference host runtime, loads
// libtsmath.so at run time as a host would, sets up a workspace arena and
// runs analysis steps on a generated data set, printing results and codes.
//
//   tsdemo [path/to/libtsmath.so]
#include <dlfcn.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <utility>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <vector>

#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace {

void* gLibrary = nullptr;

template <class Fn>
Fn Entry(const char* name) {
  void* f = dlsym(gLibrary, name);
  if (f == nullptr) {
    std::fprintf(stderr, "tsdemo: %s is not exported\n", name);
    std::exit(2);
  }
  return reinterpret_cast<Fn>(f);
}
#define ENTRY(name) Entry<decltype(&name)>(#name)

template <class Block>
Block** NewArray(int32_t type, const std::vector<double>& v) {
  return static_cast<Block**>(tsrt_new_array(type, static_cast<int32_t>(v.size()), v.data()));
}

int32_t CountOf(void* h) {
  int32_t n;
  std::memcpy(&n, *static_cast<void**>(h), 4);
  return n;
}

double F64At(F64ArrayHdl h, int32_t i) {
  double v;
  std::memcpy(&v, reinterpret_cast<char*>(*h) + 4 + 8 * i, 8);
  return v;
}

int32_t I32At(I32ArrayHdl h, int32_t i) {
  int32_t v;
  std::memcpy(&v, reinterpret_cast<char*>(*h) + 4 + 4 * i, 4);
  return v;
}

// A data set with a known shape: 2000 readings of a 50 Hz-like tone of
// amplitude 2 on an offset of 10, with noise from a fixed linear congruential
// source and a stuck sensor value (12.5) repeated now and then.
std::vector<double> Readings() {
  std::vector<double> x(2000);
  uint64_t s = 12345;
  for (size_t i = 0; i < x.size(); ++i) {
    s = s * 6364136223846793005ull + 1442695040888963407ull;
    const double noise = (static_cast<double>(s >> 11) / 9007199254740992.0 - 0.5) * 0.8;
    x[i] = (i % 97 == 0) ? 12.5 : 10.0 + 2.0 * std::sin(2 * M_PI * 50.0 * i / 1000.0 + 0.3) + noise;
  }
  return x;
}

// Magnitudes |X[k]| * 2 / n of the real FFT of x (bins 0 .. n/2).
std::vector<double> Magnitudes(F64ArrayHdl x, int n) {
  auto X = static_cast<CxArrayHdl>(tsrt_new_array(TSM_TYPE_CX128, 0, nullptr));
  PlanHolder* state = nullptr;
  ENTRY(ReKWFFTH80)(x, X, &state, 0, n, 0);
  std::vector<double> m(n / 2 + 1);
  for (int k = 0; k <= n / 2; ++k) {
    double re, im;
    std::memcpy(&re, reinterpret_cast<char*>(*X) + 4 + 16 * k, 8);
    std::memcpy(&im, reinterpret_cast<char*>(*X) + 12 + 16 * k, 8);
    m[k] = std::hypot(re, im) * 2 / n;
  }
  tsrt_dispose(X);
  return m;
}

// Three tones (50, 120 and 333 Hz at 1 kHz sampling, amplitudes 1, 0.5 and
// 0.25) over 1000 samples: the strongest bins of the real FFT.
void Spectrum() {
  const int n = 1000;
  std::vector<double> tones(n);
  for (int i = 0; i < n; ++i) {
    const double t = i / 1000.0;
    tones[i] = std::sin(2 * M_PI * 50 * t) + 0.5 * std::sin(2 * M_PI * 120 * t + 1.0) +
               0.25 * std::cos(2 * M_PI * 333 * t);
  }
  F64ArrayHdl x = NewArray<F64Array>(TSM_TYPE_F64, tones);
  const std::vector<double> m = Magnitudes(x, n);
  std::printf("  spectrum of three tones (ReKWFFTH80, %d bins), strongest bins:\n", n / 2 + 1);
  std::vector<std::pair<double, int>> bins;
  for (int k = 0; k <= n / 2; ++k) bins.push_back({m[k], k});
  std::sort(bins.begin(), bins.end(), std::greater<>());
  for (int i = 0; i < 4; ++i)
    std::printf("    %4d Hz  amplitude %.12f\n", bins[i].second, bins[i].first);
  std::printf("\n");
  tsrt_dispose(x);
}

// Leakage: a strong tone between two bins (100.5 Hz, amplitude 1) and a weak
// one 80 dB below it (140 Hz), 1024 samples at 1024 Hz. Without a window the
// strong tone's leakage buries the weak one; a four-term Blackman-Harris
// window, scaled to unit coherent gain, brings it out.
void Windowing() {
  const int n = 1024;
  std::vector<double> tones(n);
  for (int i = 0; i < n; ++i)
    tones[i] = std::sin(2 * M_PI * 100.5 * i / n) + 1e-4 * std::sin(2 * M_PI * 140.0 * i / n);
  F64ArrayHdl plain = NewArray<F64Array>(TSM_TYPE_F64, tones);
  F64ArrayHdl windowed = NewArray<F64Array>(TSM_TYPE_F64, tones);
  WinConsts consts{};
  const int32_t code = ENTRY(ScaledWinH)(windowed, 7, 0.0, &consts);
  std::printf("  two tones, 100.5 Hz at 0 dB and 140 Hz at -80 dB; four-term Blackman-Harris window\n"
              "  (ScaledWinH code %d, coherent gain %.6f, noise bandwidth %.6f bins):\n",
              code, consts.cg, consts.enbw);
  const std::vector<double> a = Magnitudes(plain, n), b = Magnitudes(windowed, n);
  std::printf("    bin      no window   windowed  (dB)\n");
  for (int k : {100, 101, 110, 120, 130, 138, 139, 140, 141, 142, 160})
    std::printf("    %4d Hz  %9.1f  %9.1f\n", k, 20 * std::log10(a[k]), 20 * std::log10(b[k]));
  std::printf("\n");
  tsrt_dispose(plain);
  tsrt_dispose(windowed);
}

// A noisy periodic signal: a 25 Hz wave with its third harmonic, 1000
// samples at 1 kHz (period 40 samples), under uniform noise of the same
// power as the wave. The power spectrum shows the two lines; the biased
// autocorrelation shows the period as peaks at lags 40, 80, ...
void PeriodicAnalysis() {
  const int n = 1000;
  std::vector<double> v(n);
  uint64_t s = 777;
  for (int i = 0; i < n; ++i) {
    s = s * 6364136223846793005ull + 1442695040888963407ull;
    const double noise = (static_cast<double>(s >> 11) / 9007199254740992.0 - 0.5) * 2.4;
    v[i] = std::sin(2 * M_PI * 25 * i / 1000.0) + 0.4 * std::sin(2 * M_PI * 75 * i / 1000.0) + noise;
  }
  F64ArrayHdl power = NewArray<F64Array>(TSM_TYPE_F64, v);
  PlanHolder* state = nullptr;
  int32_t code = ENTRY(SpectrumH)(power, &state);
  std::printf("  noisy 25 Hz + 75 Hz wave, power spectrum (SpectrumH code %d), strongest one-sided bins:\n", code);
  std::vector<std::pair<double, int>> bins;
  for (int k = 1; k < n / 2; ++k) bins.push_back({2 * F64At(power, k), k});  // both sides of bin k
  std::sort(bins.begin(), bins.end(), std::greater<>());
  for (int i = 0; i < 3; ++i) std::printf("    %4d Hz  power %.6f\n", bins[i].second, bins[i].first);

  F64ArrayHdl r = NewArray<F64Array>(TSM_TYPE_F64, v);
  ENTRY(AutoCorrelation80)(r, 2, &code);
  std::printf("  biased autocorrelation (AutoCorrelation80 code %d, %d lags), zero lag at index %d:\n", code,
              CountOf(r), n - 1);
  for (int lag : {0, 10, 20, 30, 40, 60, 80, 120})
    std::printf("    lag %3d  %9.5f\n", lag, F64At(r, n - 1 + lag));
  std::printf("\n");
  tsrt_dispose(power);
  tsrt_dispose(r);
}

// A trapezoidal pulse train sampled at 1 MHz: levels 0.2 V and 3.3 V, period
// 100 us, 40 us at the top, edges of 8 us (rise) and 4 us (fall), a 6 %
// overshoot after each rising edge that dies away, and +-10 mV of noise.
void PulseTrain() {
  const int n = 1000;
  const double dt = 1e-6, low = 0.2, high = 3.3, amp = high - low;
  std::vector<double> v(n);
  uint64_t s = 4242;
  for (int i = 0; i < n; ++i) {
    const double t = std::fmod(i + 10.0, 100.0);  // samples into the period
    double y = t < 8 ? t / 8 : t < 48 ? 1 : t < 52 ? 1 - (t - 48) / 4 : 0;
    if (t >= 8 && t < 48) y += 0.06 * std::exp(-(t - 8) / 3) * std::cos((t - 8) * 0.8);
    s = s * 6364136223846793005ull + 1442695040888963407ull;
    const double noise = (static_cast<double>(s >> 11) / 9007199254740992.0 - 0.5) * 0.02;
    v[i] = low + amp * y + noise;
  }
  F64ArrayHdl x = NewArray<F64Array>(TSM_TYPE_F64, v);
  const ReferenceLevels refs{90, 50, 10, 1};
  const LevelMethod levels{0, 200};
  HistogramBuffer* histogram = nullptr;
  double hi = 0, lo = 0, a = 0;
  int32_t code = ENTRY(StateLevels)(x, 0.0, dt, 0, 200, &histogram, &hi, &lo, &a, 0);
  std::printf("  pulse train, 0.2 V / 3.3 V, period 100 us, 40 us high, edges 8 us and 4 us, 6 %% overshoot:\n");
  std::printf("    state levels (histogram): low %.4f V, high %.4f V, amplitude %.4f V  (code %d)\n", lo, hi, a,
              code);
  double period = 0, width = 0, duty = 0, center = 0, lowRef = 0, midRef = 0, highRef = 0;
  code = ENTRY(PulseMeasEx)(x, 0.0, dt, 1, 0, 1, &refs, &levels, &histogram, &period, &width, &duty, &center,
                            &lowRef, &midRef, &highRef, 0);
  std::printf("    pulse 1: period %.3f us, width %.3f us, duty cycle %.2f %%, centre %.3f us  (code %d)\n",
              period * 1e6, width * 1e6, duty * 100, center * 1e6, code);
  for (uint16_t polarity : {1, 0}) {
    double slope = 0, duration = 0, start = 0, end = 0, preU = 0, preO = 0, postU = 0, postO = 0;
    code = ENTRY(TransMeas)(x, 0.0, dt, polarity, 1, &refs, &levels, &histogram, &slope, &duration, &start, &end,
                            &lowRef, &midRef, &highRef, &preU, &preO, &postU, &postO, 0);
    std::printf("    %s edge 1: 10-90 %% time %.3f us, slope %.4f V/us, overshoot %.2f %%, undershoot %.2f %%"
                "  (code %d)\n",
                polarity == 1 ? "rising " : "falling", duration * 1e6, slope * 1e-6, polarity == 1 ? postO : postU,
                polarity == 1 ? postU : postO, code);
  }
  std::printf("\n");
  tsrt_dispose(x);
}

// A few special-function values beside closed forms.
void SpecialValues() {
  struct Row {
    const char* what;
    double value;
    double exact;
  };
  double v[16];
  ENTRY(TS_Gamma)(0.5, NAN, &v[0]);
  ENTRY(TS_LnGamma)(100.0, &v[1]);
  ENTRY(TS_Psi)(1.0, &v[2]);
  ENTRY(TS_Erf)(1.0, &v[3]);
  ENTRY(TS_Zeta)(2.0, &v[4]);
  ENTRY(TS_Beta)(2.0, 3.0, NAN, &v[5]);
  ENTRY(TS_Elliptic1)(0.0, NAN, &v[6]);
  ENTRY(TS_Diln)(0.5, &v[7]);
  ENTRY(TS_ExpI)(1.0, 1, &v[8]);
  ENTRY(TS_Fact)(20, &v[9]);
  ENTRY(TS_BesselJr)(0.5, M_PI / 2, &v[10]);
  ENTRY(TS_BesselYs)(0, 1.0, &v[11]);
  ENTRY(TS_BesselIr)(0.5, 1.0, &v[12]);
  ENTRY(TS_BesselKn)(0, 1.0, &v[13]);
  ENTRY(TS_Struve)(M_PI, 0.5, &v[14]);
  ENTRY(TS_ParabolicCylinder)(1.0, 1.0, &v[15]);
  const Row rows[] = {
      {"Gamma(1/2)", v[0], std::sqrt(M_PI)},
      {"ln Gamma(100)", v[1], 359.13420536957539878},
      {"psi(1)", v[2], -0.57721566490153286061},
      {"erf(1)", v[3], 0.84270079294971486934},
      {"zeta(2)", v[4], M_PI * M_PI / 6},
      {"B(2, 3)", v[5], 1.0 / 12},
      {"K(m = 0)", v[6], M_PI / 2},
      {"dilogarithm(1/2)", v[7], M_PI * M_PI / 12 - M_LN2 * M_LN2 / 2},
      {"E1(1)", v[8], 0.21938393439552027368},
      {"20!", v[9], 2432902008176640000.0},
      {"J_1/2(pi/2)", v[10], 2 / M_PI},
      {"y_0(1)", v[11], -std::cos(1.0)},
      {"I_1/2(1)", v[12], std::sqrt(2 / M_PI) * std::sinh(1.0)},
      {"K_0(1)", v[13], 0.42102443824070833334},
      {"H_1/2(pi)", v[14], 2 * std::sqrt(2 / (M_PI * M_PI))},
      {"D_1(1)", v[15], std::exp(-0.25)},
  };
  std::printf("  special functions (TS_ entries) beside closed forms:      relative error\n");
  for (const Row& r : rows)
    std::printf("    %-18s %24.17g %24.17g  %8.1e\n", r.what, r.value, r.exact,
                std::fabs(r.value - r.exact) / std::fabs(r.exact));
  std::printf("\n");
}

// 20000 samples of Gaussian noise (sd 1) in bins of 0.5 against the counts
// its density predicts.
void GaussianHistogram() {
  int32_t n = 20000, seed = 17, code = 0;
  double sd = 1.0;
  NoiseState state{0, 0, 0};
  GaussSpare spare{0, 0.0};
  auto out = static_cast<F64ArrayHdl>(tsrt_new_array(TSM_TYPE_F64, 0, nullptr));
  ENTRY(Gauss)(out, &n, &sd, &seed, &code, &state, &spare);
  std::printf("  Gaussian noise, %d samples, sd 1 (Gauss code %d): counts per bin against the density\n",
              CountOf(out), code);
  const double width = 0.5;
  std::vector<int> counts(12, 0);
  for (int32_t i = 0; i < CountOf(out); ++i) {
    const int b = static_cast<int>(std::floor((F64At(out, i) + 3.0) / width));
    if (b >= 0 && b < 12) ++counts[b];
  }
  for (int b = 0; b < 12; ++b) {
    const double lo = -3.0 + b * width, hi = lo + width;
    const double expected = n * 0.5 * (std::erf(hi / M_SQRT2) - std::erf(lo / M_SQRT2));
    std::printf("    [%4.1f, %4.1f)  %5d  expected %7.1f  ", lo, hi, counts[b], expected);
    for (int k = 0; k < counts[b] / 100; ++k) std::putchar('#');
    std::putchar('\n');
  }
  std::printf("\n");
  tsrt_dispose(out);
}

}  // namespace

int main(int argc, char** argv) {
  const char* path = argc > 1 ? argv[1] : TSM_LIBRARY_FILE;
  gLibrary = dlopen(path, RTLD_NOW | RTLD_LOCAL);
  if (gLibrary == nullptr) {
    std::fprintf(stderr, "tsdemo: cannot load %s: %s\n", path, dlerror());
    return 2;
  }
  std::printf("tsdemo: host runtime version %08x, library %s\n\n", gTSRTVersion, path);

  ErrorCluster err{0, 0};
  ENTRY(InitializeAnalysisWorkspaceH)(1u << 20, &err);
  ENTRY(EnableAnalysisWorkspaceH)(&err);
  std::printf("workspace: 1 MiB arena enabled, status %u code %d\n\n", err.status, err.code);

  const std::vector<double> readings = Readings();
  F64ArrayHdl x = NewArray<F64Array>(TSM_TYPE_F64, readings);
  std::printf("data set: %zu readings, tone of amplitude 2 on 10, noise +-0.4, stuck value 12.5 every 97th\n\n",
              readings.size());

  double v = 0;
  int32_t code = 0;
  ENTRY(Mean_head)(x, &v, &code);
  std::printf("  mean                  %.12g   (code %d)\n", v, code);
  ENTRY(Median_head)(x, &v, &code);
  std::printf("  median                %.12g   (code %d)\n", v, code);
  ENTRY(RMS_head)(x, &v, &code);
  std::printf("  rms                   %.12g   (code %d)\n", v, code);
  for (int32_t order = 2; order <= 4; ++order) {
    ENTRY(Moment_head)(x, &order, &v, &code);
    std::printf("  central moment %d      %.12g   (code %d)\n", order, v, code);
  }

  std::vector<double> head(readings.begin(), readings.begin() + 1000);
  std::vector<double> clean(1200);
  for (size_t i = 0; i < clean.size(); ++i) clean[i] = 10.0 + 2.0 * std::sin(2 * M_PI * 50.0 * i / 1000.0 + 0.3);
  F64ArrayHdl y = NewArray<F64Array>(TSM_TYPE_F64, clean);
  F64ArrayHdl first = NewArray<F64Array>(TSM_TYPE_F64, head);
  ENTRY(MSE_head)(first, y, &v, &code);
  std::printf("  mse vs clean tone     %.12g   (code %d: lengths 1000 and 1200 differ)\n", v, code);

  std::vector<double> iq(2 * readings.size());
  for (size_t i = 0; i < readings.size(); ++i) {
    iq[2 * i] = readings[i] - 10.0;
    iq[2 * i + 1] = 0.5;
  }
  auto z = static_cast<CxArrayHdl>(tsrt_new_array(TSM_TYPE_CX128, static_cast<int32_t>(readings.size()), iq.data()));
  code = ENTRY(CxRMS_head)(z, &v);
  std::printf("  rms of complex        %.12g   (code %d)\n\n", v, code);

  F64ArrayHdl modes = NewArray<F64Array>(TSM_TYPE_F64, {});
  code = ENTRY(ModeH)(x, 0, modes);
  std::printf("  modes, exact values:  ");
  for (int32_t i = 0; i < CountOf(modes); ++i) std::printf("%.12g ", F64At(modes, i));
  std::printf("  (code %d)\n", code);
  code = ENTRY(ModeH)(x, 20, modes);
  std::printf("  modes, 20 bins:       ");
  for (int32_t i = 0; i < CountOf(modes); ++i) std::printf("%.6g ", F64At(modes, i));
  std::printf("  (code %d)\n\n", code);

  int32_t bins = 12;
  auto counts = static_cast<I32ArrayHdl>(tsrt_new_array(TSM_TYPE_I32, 0, nullptr));
  F64ArrayHdl centres = NewArray<F64Array>(TSM_TYPE_F64, {});
  ENTRY(histgran_head)(x, &bins, counts, centres, &code);
  std::printf("  histogram, %d bins (code %d):\n", bins, code);
  for (int32_t b = 0; b < CountOf(counts); ++b) {
    std::printf("    %8.4f %5d ", F64At(centres, b), I32At(counts, b));
    for (int32_t k = 0; k < I32At(counts, b) / 8; ++k) std::putchar('#');
    std::putchar('\n');
  }

  GenHistInterval bands[3] = {{8.0, 9.0, 0}, {9.0, 11.0, 0}, {11.0, 12.0, 2}};
  auto intervals = static_cast<GenHistIntervalHdl>(tsrt_new_array(TSM_TYPE_U8, 0, nullptr));
  NumericArrayResize(TSM_TYPE_U8, 1, &intervals, sizeof bands);
  int32_t three = 3;
  std::memcpy(*intervals, &three, 4);
  std::memcpy(reinterpret_cast<char*>(*intervals) + 4, bands, sizeof bands);
  GenHistOutliers out{};
  ENTRY(GenHistH)(x, intervals, counts, &out, &code);
  std::printf("\n  bands [8,9) [9,11) [11,12]: %d %d %d; outside %d (below %d, above %d)  (code %d)\n",
              I32At(counts, 0), I32At(counts, 1), I32At(counts, 2), out.total, out.below, out.above, code);

  F64ArrayHdl empty = NewArray<F64Array>(TSM_TYPE_F64, {});
  ENTRY(Mean_head)(empty, &v, &code);
  std::printf("\n  mean of an empty array: %g (code %d)\n", v, code);
  std::vector<double> withNaN = {1.0, NAN, 3.0};
  F64ArrayHdl bad = NewArray<F64Array>(TSM_TYPE_F64, withNaN);
  ENTRY(Median_head)(bad, &v, &code);
  std::printf("  median with a NaN:      %g (code %d)\n\n", v, code);

  for (void* h : {static_cast<void*>(x), static_cast<void*>(y), static_cast<void*>(first), static_cast<void*>(z),
                  static_cast<void*>(modes), static_cast<void*>(counts), static_cast<void*>(centres),
                  static_cast<void*>(intervals), static_cast<void*>(empty), static_cast<void*>(bad)})
    tsrt_dispose(h);

  Spectrum();
  Windowing();
  PeriodicAnalysis();
  PulseTrain();
  SpecialValues();
  GaussianHistogram();

  ENTRY(DisableAnalysisWorkspaceH)(&err);
  ENTRY(UninitializeAnalysisWorkspaceH)(&err);
  std::printf("workspace removed: status %u code %d\n", err.status, err.code);
  const int32_t ran = tsrt_end_run();  // the host ends its run: reserved plans are released
  std::printf("host run ended: %d clean-up(s) ran; host blocks still live: %lld\n", ran,
              static_cast<long long>(tsrt_live_blocks()));
  return err.status == 0 && tsrt_live_blocks() == 0 ? 0 : 1;
}
