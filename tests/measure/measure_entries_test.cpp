// The state level, pulse, cycle and transition entries on sampled trapezoids
// whose crossings, widths, periods, levels and shoots are known in closed
// form; the histogram rules on hand-made data; every failure code with its
// outputs; the histogram buffer's life through the host's clean-up.
#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <functional>
#include <limits>
#include <random>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_fixture.h"

namespace {

using tsmtest::F64;
using V = std::vector<double>;

constexpr double kPreset = 777.0;  // stale value in every output before a call

// Every test ends the host run: no buffer outlives it, and no block leaks.
using Measure = tsmtest::HostRunTest;

// A periodic trapezoid in continuous time; its crossing instants are closed forms.
struct Trapezoid {
  double low, high;
  double delay;                    // start of the first rise
  double rise, top, fall, period;  // ramp durations, high plateau, period

  double operator()(double t) const {
    double u = std::fmod(t - delay, period);
    if (u < 0) u += period;
    const double span = high - low;
    if (u < rise) return low + span * u / rise;
    if (u < rise + top) return high;
    return u < rise + top + fall ? high - span * (u - rise - top) / fall : low;
  }
  // Instant at which rise k (from 0) or fall k passes level v.
  double RiseAt(int k, double v) const { return delay + k * period + (v - low) / (high - low) * rise; }
  double FallAt(int k, double v) const { return delay + k * period + rise + top + (high - v) / (high - low) * fall; }
  // Samples at t0 + i dt, with uniform noise of the given bound.
  V Sample(double t0, double dt, int n, double noise = 0) const {
    std::mt19937_64 gen(7);
    std::uniform_real_distribution<double> u(-noise, noise);
    V x(n);
    for (int i = 0; i < n; ++i) x[i] = (*this)(t0 + i * dt) + (noise > 0 ? u(gen) : 0.0);
    return x;
  }
};

// Mean and sum of squares of x[from, to) in long double.
double LongMean(const V& x, int from, int to) {
  long double s = 0;
  for (int i = from; i < to; ++i) s += x[i];
  return static_cast<double>(s / (to - from));
}
double LongSumSquares(const V& x, int from, int to) {
  long double s = 0;
  for (int i = from; i < to; ++i) s += static_cast<long double>(x[i]) * x[i];
  return static_cast<double>(s);
}

// Each output within its own tolerance; NaN skips an output.
void ExpectNear(const V& got, const V& want, const V& tol) {
  for (size_t i = 0; i < want.size(); ++i) {
    if (!std::isnan(want[i])) {
      EXPECT_NEAR(got[i], want[i], tol[i]) << "output " << i;
    }
  }
}

ReferenceLevels Percent(double lo = 10, double mid = 50, double hi = 90) { return {hi, mid, lo, 1}; }
ReferenceLevels Units(double lo, double mid, double hi) { return {hi, mid, lo, 0}; }

// Four periods of 100 samples between the states 0 and 1: rises over
// [10.3, 30.3], falls over [50.3, 70.3]. Each period also has a dip to -0.03
// late on the low state (before a rise), a spike to 1.15 early on the high
// state (after a rise), a spike to 1.08 late on it (before a fall) and a dip
// to -0.05 early on the low state (after a fall). With 12 bins over
// [-0.05, 1.15] the two states are bin centres, exactly 0 and 1.
V FeatureWave() {
  const Trapezoid tz{0, 1, 10.3, 20, 20, 20, 100};
  V x = tz.Sample(0, 1, 400);
  for (int k = 0; k < 400; k += 100) {
    x[k + 5] = -0.03;
    x[k + 35] = 1.15;
    x[k + 45] = 1.08;
    x[k + 75] = -0.05;
  }
  return x;
}

struct Levels {
  int32_t code;
  double high, low, amplitude;
};
Levels RunLevels(const V& xs, uint32_t method, int32_t bins, int32_t option = 0, double dt = 1,
                 HistogramBuffer** var = nullptr) {
  F64 x(xs);
  HistogramBuffer* own = nullptr;
  Levels r{0, kPreset, kPreset, kPreset};
  r.code = StateLevels(x.Handle(), 0, dt, method, bins, var ? var : &own, &r.high, &r.low, &r.amplitude, option);
  return r;
}

// Results of the three measurement entries in one shape: code, then outputs.
struct Outcome {
  int32_t code;
  std::vector<double> out;
};

struct Call {
  double t0 = 0, dt = 1;
  int32_t number = 1;
  uint16_t polarity = 1;
  bool ignorePeriod = false;
  ReferenceLevels refs = Percent();
  LevelMethod how = {0, 100};
  int32_t option = 0;
  bool noRecord = false;  // pass a null ReferenceLevels
};

// period, width, duty, centre, low, mid, high; PulseMeas unless ignorePeriod is set.
Outcome RunPulse(const V& xs, const Call& c) {
  F64 x(xs);
  HistogramBuffer* var = nullptr;
  Outcome r{0, V(7, kPreset)};
  double* o = r.out.data();
  const ReferenceLevels* refs = c.noRecord ? nullptr : &c.refs;
  r.code = c.ignorePeriod ? PulseMeasEx(x.Handle(), c.t0, c.dt, c.polarity, 1, c.number, refs, &c.how, &var, o,
                                        o + 1, o + 2, o + 3, o + 4, o + 5, o + 6, c.option)
                          : PulseMeas(x.Handle(), c.t0, c.dt, c.polarity, c.number, refs, &c.how, &var, o, o + 1,
                                      o + 2, o + 3, o + 4, o + 5, o + 6, c.option);
  return r;
}
// mean, rms, start, end, low, mid, high
Outcome RunCycle(const V& xs, const Call& c) {
  F64 x(xs);
  Outcome r{0, V(7, kPreset)};
  double* o = r.out.data();
  r.code = CycleRMSAverage(x.Handle(), c.t0, c.dt, c.number, &c.refs, &c.how, nullptr, o, o + 1, o + 2, o + 3, o + 4,
                           o + 5, o + 6, c.option);
  return r;
}
// slope, duration, start, end, low, mid, high, preUnder, preOver, postUnder, postOver
Outcome RunTrans(const V& xs, const Call& c) {
  F64 x(xs);
  HistogramBuffer* var = nullptr;
  Outcome r{0, V(11, kPreset)};
  double* o = r.out.data();
  r.code = TransMeas(x.Handle(), c.t0, c.dt, c.polarity, c.number, &c.refs, &c.how, &var, o, o + 1, o + 2, o + 3,
                     o + 4, o + 5, o + 6, o + 7, o + 8, o + 9, o + 10, c.option);
  return r;
}

// Histogram states: the most populated bin of the lower 40% and the upper 40%
// of the range, ties to the outer bin; the middle never counts.
TEST_F(Measure, HistogramStatesFollowTheSideRules) {
  const auto rep = [](std::initializer_list<std::pair<double, int>> parts) {
    V v;
    for (auto [value, k] : parts) v.insert(v.end(), k, value);
    return v;
  };
  // 10 bins over [0, 10]: bin b is centred on b + 0.5.
  struct Case { V x; double low, high; } cases[] = {
      {rep({{0, 3}, {2.5, 3}, {5.5, 10}, {7.5, 3}, {10, 3}}), 0.5, 9.5},  // ties go outward, bin 5 ignored
      {rep({{0, 3}, {4.5, 4}, {5.5, 10}, {6.5, 4}, {10, 3}}), 4.5, 6.5},  // bins 4 and 6 still count
      {rep({{0, 1}, {1.5, 2}, {8.5, 2}, {10, 1}}), 1.5, 8.5},
  };
  for (const Case& c : cases) {
    const Levels r = RunLevels(c.x, 0, 10);
    EXPECT_EQ(r.code, 0);
    EXPECT_NEAR(r.low, c.low, 1e-12);
    EXPECT_NEAR(r.high, c.high, 1e-12);
    EXPECT_NEAR(r.amplitude, c.high - c.low, 1e-12);
  }
}

// The automatic method takes a side's bin only when it holds more than 5% of
// the samples; option 1 takes the histogram only when both sides do.
TEST_F(Measure, AutomaticLevelsNeedPopulatedSides) {
  // 100 samples over [0, 10], 10 bins, threshold 5: bin 0 holds the 0 and
  // the 0.5s, bin 9 the 9.5s and the 10.
  const auto make = [](int lowCount, int highCount) {
    V x{0};
    x.insert(x.end(), lowCount, 0.5);
    x.insert(x.end(), 98 - lowCount - highCount, 5.0);
    x.insert(x.end(), highCount, 9.5);
    x.push_back(10);
    return x;
  };
  struct Case { int lowCount, highCount, option; double low, high; } cases[] = {
      {4, 20, 0, 0, 9.5}, {5, 20, 0, 0.5, 9.5}, {10, 4, 0, 0.5, 10},
      {10, 20, 1, 0.5, 9.5}, {10, 4, 1, 0, 10}, {4, 20, 1, 0, 10},
  };
  for (const Case& c : cases) {
    const Levels r = RunLevels(make(c.lowCount, c.highCount), 2, 10, c.option);
    EXPECT_EQ(r.code, 0);
    EXPECT_DOUBLE_EQ(r.low, c.low) << c.lowCount << " " << c.highCount << " " << c.option;
    EXPECT_DOUBLE_EQ(r.high, c.high) << c.lowCount << " " << c.highCount << " " << c.option;
  }
  const Levels minmax = RunLevels({3, -1, 4, 1}, 1, 7);
  EXPECT_EQ(minmax.code, 0);
  EXPECT_EQ(minmax.low, -1);
  EXPECT_EQ(minmax.high, 4);
  EXPECT_EQ(minmax.amplitude, 5);
  const Levels flat = RunLevels(V(8, 2.5), 1, 7);
  EXPECT_EQ(flat.code, 0);
  EXPECT_EQ(flat.low, flat.high);
}

// Pulse, cycle and transition figures of sampled trapezoids against their
// closed forms, at two rates, three sample offsets, long and short ramps,
// with and without noise. Long clean ramps are interpolated exactly; a ramp
// of 3 samples may put a plateau sample into the interpolation (one sample
// interval of error); noise moves levels and crossings by noise/slope.
TEST_F(Measure, TrapezoidTrainsGiveTheirClosedForms) {
  const double low = -0.7, high = 2.3, span = high - low, t0 = 0.003, period = 0.1;
  const int bins = 100;
  const double w = span / bins;
  for (double dt : {1e-3, 3.7e-4})
    for (double offset : {0.0, 0.31, 0.77})
      for (double noise : {0.0, 0.01 * span})
        for (bool shortRamp : {false, true}) {
          const double rise = shortRamp ? 3 * dt : 0.012;
          const Trapezoid tz{low, high, 0.02 + offset * dt, rise, 0.04, 1.25 * rise, period};
          const int n = static_cast<int>(5 * period / dt);
          const V x = tz.Sample(t0, dt, n, noise);
          SCOPED_TRACE(testing::Message() << "dt " << dt << " offset " << offset << " noise " << noise
                                          << " short " << shortRamp);
          // States half a bin inside the extremes; references 10/50/90%.
          const double lowS = low + w / 2, amp = span - w;
          const double lo = amp * 10 / 100 + lowS, mid = amp * 50 / 100 + lowS, hi = amp * 90 / 100 + lowS;
          const double tolL = noise > 0 ? noise + w : 1e-12;
          const double tolT = (shortRamp ? dt : 1e-9 * dt) + (noise > 0 ? 2 * (noise + w) * rise / span * 1.25 : 0);

          Call c{t0, dt, 2};
          const double r1 = tz.RiseAt(1, mid), f1 = tz.FallAt(1, mid), r2 = tz.RiseAt(2, mid);
          for (uint16_t pol : {1, 0}) {
            c.polarity = pol;
            const Outcome p = RunPulse(x, c);
            ASSERT_EQ(p.code, 0);
            const double a = pol ? r1 : f1, b = pol ? f1 : r2;
            ExpectNear(p.out, {period, b - a, (b - a) / period, (a + b) / 2, lo, mid, hi},
                       {2 * tolT, 2 * tolT, 4 * tolT / period, tolT, tolL, tolL, tolL});
          }

          const Outcome cy = RunCycle(x, c);
          ASSERT_EQ(cy.code, 0);
          const int count = static_cast<int>(period / dt + 0.5), first = static_cast<int>(0.5 + (r1 - t0) / dt);
          const double tolM = noise > 0 ? 2 * span / count : 1e-12;
          const double mean = LongMean(x, first, first + count);
          const double rms = std::sqrt(LongSumSquares(x, first, first + count) / count);
          ExpectNear(cy.out, {mean, rms, r1, r1 + period}, {tolM, tolM, tolT, 2 * tolT});

          for (uint16_t pol : {1, 0}) {
            c.polarity = pol;
            const Outcome t = RunTrans(x, c);
            ASSERT_EQ(t.code, 0);
            const double start = pol ? tz.RiseAt(1, lo) : tz.FallAt(1, hi);
            const double end = pol ? tz.RiseAt(1, hi) : tz.FallAt(1, lo);
            EXPECT_NEAR(t.out[0] * (end - start) / (hi - lo), 1, 2 * tolT / (end - start) + 2 * tolL / amp);
            ExpectNear(t.out, {NAN, end - start, start, end, lo, NAN, hi}, {0, 2 * tolT, tolT, tolT, tolL, 0, tolL});
          }
        }
}

// Every selector of measurements_fetch on the featured wave, pulse 2.
TEST_F(Measure, FetchGivesEverySelector) {
  const V x = FeatureWave();
  const double t0 = 0.25, dt = 2e-3;
  const auto at = [&](double p) { return t0 + p * dt; };
  const double rms = std::sqrt(LongSumSquares(x, 0, 400) / 400);
  const double cycleRms = std::sqrt(LongSumSquares(x, 0, 100) / 100);
  constexpr double nan = std::numeric_limits<double>::quiet_NaN();
  struct Case { int32_t selector; double value, start = nan, end = nan; } cases[] = {
      {0, -0.05}, {1, 1.15}, {2, 1.2}, {3, 0}, {4, 1}, {5, 1}, {6, 1}, {7, 0}, {8, 1},
      {9, 0.1}, {10, 0.5}, {11, 0.9}, {12, 0.4}, {13, rms}, {14, LongMean(x, 0, 400)},
      {15, 100 * dt}, {16, 1 / (100 * dt)},
      {17, cycleRms, at(120.3), at(220.3)}, {18, LongMean(x, 0, 100), at(120.3), at(220.3)},
      {19, 16 * dt, at(152.3), at(168.3)}, {20, 16 * dt, at(112.3), at(128.3)},
      {21, std::sqrt(LongSumSquares(x, 0, 400))},
      {22, 40 * dt}, {23, 60 * dt}, {24, 0.4}, {25, 0.6},
      {26, 3, at(112.3), at(128.3)}, {27, 8, at(152.3), at(168.3)},
      {28, 15, at(112.3), at(128.3)}, {29, 5, at(152.3), at(168.3)},
      {30, at(140.3)}, {31, at(190.3)}, {32, 0.05 / dt, at(112.3), at(128.3)}, {33, 0.05 / dt, at(152.3), at(168.3)},
  };
  const ReferenceLevels refs = Percent();
  const LevelMethod how{0, 12};
  for (const Case& c : cases) {
    double result = kPreset;
    std::array<double, 2> times{kPreset, kPreset};
    const int32_t registered = tsrt_cleanup_count();
    EXPECT_EQ(measurements_fetch(nullptr, c.selector, &refs, &how, 2, t0, dt, x.data(), 400, &result, times.data()), 0)
        << c.selector;
    EXPECT_EQ(tsrt_cleanup_count(), registered + 1);  // a fresh buffer, left to the clean-up
    EXPECT_NEAR(result, c.value, 1e-9 * std::max(1.0, std::fabs(c.value))) << c.selector;
    EXPECT_NEAR(times[0], std::isnan(c.start) ? kPreset : c.start, 1e-12) << c.selector;
    EXPECT_NEAR(times[1], std::isnan(c.end) ? kPreset : c.end, 1e-12) << c.selector;
  }
  // Positions that all round to t0 = 1e20 make a period of 0: infinite frequency, no code.
  double frequency = 0;
  EXPECT_EQ(measurements_fetch(nullptr, 16, &refs, &how, 2, 1e20, dt, x.data(), 400, &frequency, nullptr), 0);
  EXPECT_EQ(frequency, std::numeric_limits<double>::infinity());
  for (int32_t selector : {34, -1, 1000}) {
    double result = kPreset;
    EXPECT_EQ(measurements_fetch(nullptr, selector, &refs, &how, 2, t0, dt, x.data(), 400, &result, nullptr), 0);
    EXPECT_EQ(result, kPreset);
  }
}

// With ignorePeriod a single pulse is enough for its width; the period and
// duty cycle are 0. A pulse of the other polarity needs the missing crossing.
TEST_F(Measure, IgnoringThePeriodMeasuresALonePulse) {
  const V x = Trapezoid{0, 1, 10.3, 20, 20, 20, 1000}.Sample(0, 1, 100);
  Call c;
  c.ignorePeriod = true;
  const Outcome p = RunPulse(x, c);
  ASSERT_EQ(p.code, 0);
  ExpectNear(p.out, {0, 40, 0, 40.3}, {0, 1e-9, 0, 1e-9});
  c.polarity = 0;
  EXPECT_EQ(RunPulse(x, c).code, TSM_ERR_TOO_FEW_CROSSINGS);
  c.ignorePeriod = false;
  c.polarity = 1;
  EXPECT_EQ(RunPulse(x, c).code, TSM_ERR_TOO_FEW_CROSSINGS);
}

// Method 1 takes its references from the extremes, but the shoots are still
// measured against the histogram's states.
TEST_F(Measure, MinMaxReferencesHistogramShoots) {
  Call c{0, 1, 2};
  c.how = {1, 12};
  const Outcome t = RunTrans(FeatureWave(), c);
  ASSERT_EQ(t.code, 0);
  // 10% and 90% of 1.2 above -0.05; shoots of 3% and 15% of the unit state step.
  ExpectNear(t.out, {NAN, NAN, NAN, NAN, 0.07, NAN, 1.03, 3, NAN, NAN, 15}, {0, 0, 0, 0, 1e-12, 0, 1e-12, 1e-9, 0, 0, 1e-9});
}

// Option 1 bounds the shoot regions to three transition widths: with ramps of
// 2 samples, a dip 16 samples before the rise and a spike 12 after it drop out.
TEST_F(Measure, OptionOneNarrowsTheShootRegions) {
  V x = Trapezoid{0, 1, 10.3, 2, 38, 2, 100}.Sample(0, 1, 400);
  for (int k = 0; k < 400; k += 100) x[k + 95] = -0.05, x[k + 25] = 1.15;
  Call c{0, 1, 2};
  c.how = {0, 12};
  for (int32_t option : {0, 1}) {
    c.option = option;
    const Outcome t = RunTrans(x, c);
    ASSERT_EQ(t.code, 0);
    EXPECT_NEAR(t.out[7], option ? 0 : 5, 1e-9);
    EXPECT_NEAR(t.out[10], option ? 0 : 15, 1e-9);
  }
}

// Every failure code, with the measurement outputs left 0.
TEST_F(Measure, FailuresLeaveTheirOutputsZero) {
  const V wave = FeatureWave(), flat(50, 0.3);
  using Run = std::function<Outcome()>;
  const auto pulse = [](V x, Call c) -> Run { return [=] { return RunPulse(x, c); }; };
  const auto cycle = [](V x, Call c) -> Run { return [=] { return RunCycle(x, c); }; };
  const auto trans = [](V x, Call c) -> Run { return [=] { return RunTrans(x, c); }; };
  const auto with = [](std::function<void(Call&)> set) {
    Call c{0, 1, 2};
    set(c);
    return c;
  };
  const Call base = with([](Call&) {});
  struct Case { const char* what; Run run; int32_t code; } cases[] = {
      {"no record", pulse(wave, with([](Call& c) { c.noRecord = true; })), TSM_ERR_MISSING_RECORD},
      {"no bins", pulse(wave, with([](Call& c) { c.how.bins = 0; })), TSM_ERR_BIN_COUNT},
      {"method 3", trans(wave, with([](Call& c) { c.how.method = 3; })), TSM_ERR_METHOD_SELECTOR},
      {"pulse 0", pulse(wave, with([](Call& c) { c.number = 0; })), TSM_ERR_PULSE_NUMBER},
      {"cycle 0", cycle(wave, with([](Call& c) { c.number = -3; })), TSM_ERR_PULSE_NUMBER},
      {"transition 0", trans(wave, with([](Call& c) { c.number = 0; })), TSM_ERR_PULSE_NUMBER},
      {"empty", pulse({}, base), TSM_ERR_MEASUREMENT_COUNT},
      {"dt 0", trans(wave, with([](Call& c) { c.dt = 0; })), TSM_ERR_HISTOGRAM_ORDER},
      {"option 2", pulse(wave, with([](Call& c) { c.option = 2, c.refs = Units(0.1, 0.5, 0.9); })),
       TSM_ERR_BAD_SELECTOR},
      {"flat", pulse(flat, base), TSM_ERR_LEVELS_COINCIDE},
      {"flat, min-max states", trans(flat, with([](Call& c) { c.how.method = 1; })), TSM_ERR_LEVELS_COINCIDE},
      {"mid above high", pulse(wave, with([](Call& c) { c.refs = Units(0.1, 0.95, 0.9); })),
       TSM_ERR_REFERENCE_ORDER},
      {"mid below low", trans(wave, with([](Call& c) { c.refs = Units(0.6, 0.5, 0.9); })), TSM_ERR_REFERENCE_ORDER},
      {"low equals high", trans(wave, with([](Call& c) { c.refs = Units(0.5, 0.5, 0.5); })), TSM_ERR_REFERENCE_ORDER},
      {"pulse 4 of 4", pulse(wave, with([](Call& c) { c.number = 4; })), TSM_ERR_TOO_FEW_CROSSINGS},
      {"polarity 7", pulse(wave, with([](Call& c) { c.polarity = 7; })), TSM_ERR_TOO_FEW_CROSSINGS},
      {"edges for pulse 1e9", pulse(wave, with([](Call& c) { c.number = 1000000000; })), TSM_ERR_NO_PULSE},
      {"transitions for 1e9", trans(wave, with([](Call& c) { c.number = 1000000000; })), TSM_ERR_NO_PULSE},
      {"rise 5 of 4", trans(wave, with([](Call& c) { c.number = 5; })), TSM_ERR_INCOMPLETE_TRANSITION},
      {"transition polarity 7", trans(wave, with([](Call& c) { c.polarity = 7; })), TSM_ERR_INCOMPLETE_TRANSITION},
      // At t0 = 1e20 every position rounds to t0: a cycle of no samples, a
      // transition of no duration.
      {"collapsed cycle", cycle(wave, with([](Call& c) { c.t0 = 1e20; })), TSM_ERR_NO_CYCLE},
      {"collapsed transition", trans(wave, with([](Call& c) { c.t0 = 1e20; })), TSM_ERR_PULSE_MISSING},
  };
  for (const Case& c : cases) {
    const Outcome r = c.run();
    EXPECT_EQ(r.code, c.code) << c.what;
    for (double v : r.out) EXPECT_EQ(v, 0) << c.what;
  }

  // Without a clearing step, StateLevels and fetch give NaN.
  for (auto [bins, code] : {std::pair{0, TSM_ERR_BIN_COUNT}, {1 << 30, TSM_ERR_NO_MEMORY}}) {
    const Levels r = RunLevels(wave, 0, bins);
    EXPECT_EQ(r.code, code);
    EXPECT_TRUE(tsmtest::IsLibNaN(r.high) && tsmtest::IsLibNaN(r.low) && tsmtest::IsLibNaN(r.amplitude));
  }
  EXPECT_EQ(RunLevels(wave, 0, 12, 0, -1).code, TSM_ERR_HISTOGRAM_ORDER);
  const ReferenceLevels refs = Percent();
  const LevelMethod how{0, 12};
  struct Fetch {
    const double* data;
    int32_t n;
    double dt;
    const ReferenceLevels* refs;
    int32_t code;
  } fetches[] = {
      {wave.data(), 0, 1, &refs, TSM_ERR_MEASUREMENT_COUNT},  {wave.data(), 400, 0, &refs, TSM_ERR_HISTOGRAM_ORDER},
      {nullptr, 400, 1, &refs, TSM_ERR_MEASUREMENT_COUNT},     {wave.data(), 400, 1, nullptr, TSM_ERR_MISSING_RECORD},
      {flat.data(), 50, 1, &refs, TSM_ERR_LEVELS_COINCIDE},
  };
  for (const Fetch& f : fetches) {
    double result = kPreset;
    EXPECT_EQ(measurements_fetch(nullptr, 10, f.refs, &how, 2, 0, f.dt, f.data, f.n, &result, nullptr), f.code);
    EXPECT_TRUE(tsmtest::IsLibNaN(result));
  }
}

// Crossing and transition lists come from the workspace: the same figures
// inside an arena, -20311 when the arena cannot hold them.
TEST_F(Measure, ListsComeFromTheWorkspace) {
  const V x = FeatureWave();
  const Call c{0, 1, 2};
  const Outcome heap = RunPulse(x, c);
  for (uint32_t size : {1u << 16, 48u}) {
    tsmtest::ScopedWorkspace ws(size);
    const Outcome pulse = RunPulse(x, c), trans = RunTrans(x, c);
    EXPECT_EQ(pulse.code, size > 48 ? 0 : TSM_ERR_NO_PULSE);
    EXPECT_EQ(trans.code, size > 48 ? 0 : TSM_ERR_NO_PULSE);
    if (size > 48) {
      EXPECT_EQ(pulse.out, heap.out);
    }
  }
}

// The buffer is made on the first call, keeps its record when the bin count
// changes, and goes with the host's clean-up at the end of the run.
TEST_F(Measure, HistogramBufferLivesUntilTheHostCleansUp) {
  const V x = FeatureWave();
  HistogramBuffer* var = nullptr;
  ASSERT_EQ(RunLevels(x, 0, 12, 0, 1, &var).code, 0);
  ASSERT_NE(var, nullptr);
  const HistogramBuffer* made = var;
  EXPECT_EQ(var->bins, 12);
  EXPECT_EQ(tsrt_cleanup_count(), 1);
  for (int32_t bins : {12, 25, 3}) {
    ASSERT_EQ(RunLevels(x, 0, bins, 0, 1, &var).code, 0);
    EXPECT_EQ(var, made);
    EXPECT_EQ(var->bins, bins);
    long total = 0;
    for (int b = 0; b < bins; ++b) total += var->counts[b];
    EXPECT_EQ(total, 400);  // the counters hold the last histogram, every sample once
  }
  EXPECT_EQ(tsrt_cleanup_count(), 1);
  EXPECT_EQ(tsrt_end_run(), 1);
  EXPECT_EQ(tsrt_cleanup_count(), 0);
  EXPECT_EQ(measurements_create(nullptr), 0);
  EXPECT_EQ(measurements_clear(&var), 0);
  EXPECT_EQ(measurements_destroy(nullptr), 0);
  EXPECT_EQ(tsrt_cleanup_count(), 0);
}

}  // namespace
