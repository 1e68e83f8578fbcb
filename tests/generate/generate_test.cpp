// The waveform generators through host handles: values against closed forms
// evaluated directly in long double, continuation of the phase from call to
// call, every check with its code and order, and the failure paths.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <numbers>
#include <stdexcept>
#include <string>
#include <vector>

#include "support/host_arrays.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using LD = long double;
constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
constexpr LD kPiL = std::numbers::pi_v<LD>;

struct Out {
  int32_t ret, err;
  V y;
};
using Call = std::function<int32_t(F64ArrayHdl, int32_t*)>;

// One call with an output that holds stale values (or the given times).
Out Exec(const Call& f, const V& init = {7, 7, 7}) {
  F64 out(init);
  Out r{-1, 0x5A5A5A5A, {}};
  r.ret = f(out.Handle(), &r.err);
  r.y = out.Values();
  return r;
}

// Degrees of a wave at sample i: phase + 360 frac(f i), with f*i split
// exactly into its rounded value and error, wrapped into [0, 360).
LD DegreesAt(double phase, double f, double i) {
  const double p = f * i, e = std::fma(f, i, -p);
  LD d = std::fmod(static_cast<LD>(phase) + 360 * ((static_cast<LD>(p) - std::floor(p)) + e), 360.0L);
  return d < 0 ? d + 360 : d;
}

// ---- the continuous waves ------------------------------------------------------

enum Wave { kSine, kSquare, kSaw, kTriangle, kTable };
const V kTable5 = {0, 1, 4, 9, -2};

Call WaveCall(Wave w, int32_t n, double amp, double f, double* phase, double duty = 37, int32_t interp = 1) {
  return [=](F64ArrayHdl out, int32_t* err) mutable {
    switch (w) {
      case kSine: return SineWaveCIN(out, &n, &amp, &f, phase, err);
      case kSquare: return SquareWaveCIN(out, &n, &amp, &f, phase, &duty, err);
      case kSaw: return SawtoothWaveCIN(out, &n, &amp, &f, phase, err);
      case kTriangle: return TriangleWaveCIN(out, &n, &amp, &f, phase, err);
      case kTable: {
        F64 table(kTable5);
        return ArbitraryWaveCIN(out, &n, &amp, &f, phase, table.Handle(), &interp, err);
      }
    }
    return -1;
  };
}

// The wave's value at x degrees, unit amplitude; NaN within 1e-9 degrees of a
// jump, where the sample may fall on either side.
LD Shape(Wave w, LD x, double duty, int32_t interp) {
  const auto nearJump = [&](LD at) { return std::fabs(x - at) < 1e-9L || std::fabs(x - at - 360) < 1e-9L; };
  switch (w) {
    case kSine: return std::sin(x * kPiL / 180);
    case kSquare: return nearJump(0) || nearJump(duty * 3.6L) ? NAN : x < duty * 3.6L ? 1 : -1;
    case kSaw: return nearJump(180) ? NAN : x < 180 ? x / 180 : x / 180 - 2;
    case kTriangle: return x < 90 ? x / 90 : x < 270 ? 2 - x / 90 : x / 90 - 4;
    case kTable: {
      const LD r = x * 5 / 360;
      const int k = static_cast<int>(r);
      return interp == 1 ? kTable5[k] + (r - k) * (kTable5[(k + 1) % 5] - kTable5[k]) : nearJump(k * 72.0L) || nearJump((k + 1) * 72.0L) ? NAN : kTable5[k];
    }
  }
  return NAN;
}

TEST(GenerateWaves, MatchClosedFormsAndCarryThePhase) {
  struct Case { Wave w; int32_t n; double amp, f, phase, duty; int32_t interp; };
  const std::vector<Case> cases = {
      {kSine, 1000000, 2.5, 1e-4, 37.5, 0, 0},     {kSine, 1000000, -1.5, 0.0123, -100, 0, 0},
      {kSine, 1000000, 1, 0.1, 725, 0, 0},         {kSine, 1000000, 3, 0.3, 359.9, 0, 0},
      {kSine, 1000000, 1, 0.4571, 0, 0, 0},        {kSine, 1000000, 1, -1.2345, 12, 0, 0},
      {kSine, 1, 2, 0.3, 90, 0, 0},                {kSine, 2, 2, 0.25, 90, 0, 0},
      {kSquare, 100000, 2, 0.0371, -50, 37, 0},    {kSquare, 3000, 1, 0.01, 0, 150, 0},
      {kSquare, 3000, 1, 0.01, 0, -1, 0},          {kSaw, 100000, 1.5, 0.0371, -50, 0, 0},
      {kSaw, 1000, 1, -0.3, 1e6, 0, 0},            {kTriangle, 100000, 2, 0.0371, 400, 0, 0},
      {kTable, 100000, 2, 0.0371, -50, 0, 1},      {kTable, 100000, 2, 0.0371, 10, 0, 0},
  };
  for (const Case& c : cases) {
    double phase = c.phase;
    const Out r = Exec(WaveCall(c.w, c.n, c.amp, c.f, &phase, c.duty, c.interp));
    ASSERT_EQ(r.err, 0);
    ASSERT_EQ(r.y.size(), static_cast<size_t>(c.n));
    const double duty = std::clamp(c.duty, 0.0, 100.0);
    LD worst = 0;
    for (int32_t i = 0; i < c.n; ++i) {
      const LD want = c.amp * Shape(c.w, DegreesAt(c.phase, c.f, i), duty, c.interp);
      if (!std::isnan(want)) worst = std::max(worst, std::fabs(r.y[i] - want));
    }
    EXPECT_LE(worst, 1e-12L * std::fabs(c.amp)) << "wave " << c.w << " f=" << c.f;
    EXPECT_NEAR(phase, static_cast<double>(DegreesAt(c.phase, c.f, c.n)), 1e-11) << "wave " << c.w;
    EXPECT_TRUE(phase >= 0 && phase < 360);
  }
}

TEST(GenerateWaves, TwoCallsContinueEachOther) {
  for (const Wave w : {kSine, kSquare, kSaw, kTriangle, kTable}) {
    for (const auto& [n1, n2] : {std::pair{100, 100}, std::pair{137, 263}, std::pair{1, 999}}) {
      double whole = -10.3, parts = -10.3;
      const Out one = Exec(WaveCall(w, n1 + n2, 1.25, 0.0123456, &whole));
      const Out a = Exec(WaveCall(w, n1, 1.25, 0.0123456, &parts));
      EXPECT_TRUE(parts >= 0 && parts < 360);
      const Out b = Exec(WaveCall(w, n2, 1.25, 0.0123456, &parts));
      V joined = a.y;
      joined.insert(joined.end(), b.y.begin(), b.y.end());
      ASSERT_EQ(joined.size(), one.y.size());
      for (size_t i = 0; i < joined.size(); ++i) ASSERT_NEAR(joined[i], one.y[i], 1e-13) << "wave " << w << " i=" << i;
      EXPECT_NEAR(parts, whole, 1e-12);
    }
  }
}

TEST(GenerateWaves, EdgeValues) {
  double phase = 30;
  const Out zero = Exec(WaveCall(kSine, 55, 0, 0.1, &phase));
  EXPECT_EQ(zero.y, V(55, 0.0));
  EXPECT_NEAR(phase, 210, 1e-12);  // moves even with amp 0
  // Near a quarter of the sample rate the recurrence is only marginally
  // stable: the clipping keeps every sample within |amp|.
  phase = 10;
  const Out quarter = Exec(WaveCall(kSine, 200000, -2, 0.2499999, &phase));
  for (double v : quarter.y) ASSERT_LE(std::fabs(v), 2.0);
  // An empty table gives zeros and phase 0.
  phase = 45;
  double amp = 3, f = 0.1;
  int32_t n = 4, interp = 1;
  F64 empty;
  const Out none = Exec([&](F64ArrayHdl out, int32_t* err) {
    return ArbitraryWaveCIN(out, &n, &amp, &f, &phase, empty.Handle(), &interp, err);
  });
  EXPECT_EQ(none.err, 0);
  EXPECT_EQ(none.y, V(4, 0.0));
  EXPECT_EQ(phase, 0.0);
}

// ---- patterns ------------------------------------------------------------------

TEST(GeneratePatterns, ChirpSineAndSincMatchClosedForms) {
  int32_t n = 1000;
  double amp = 1.5, f1 = 0.01, f2 = 0.4, phase = -30, cycles = 3.5, delay = 2.25, dt = 0.125;
  const Out chirp = Exec([&](F64ArrayHdl o, int32_t* e) { return ChirpCIN(o, &n, &amp, &f1, &f2, e); });
  const Out sine = Exec([&](F64ArrayHdl o, int32_t* e) { return SinePtrn(o, &n, &amp, &phase, &cycles, e); });
  const Out sinc = Exec([&](F64ArrayHdl o, int32_t* e) { return SincWave(o, &n, &amp, &delay, &dt, e); });
  EXPECT_EQ(phase, -30);  // only read
  ASSERT_EQ(chirp.y.size() + sine.y.size() + sinc.y.size(), 3u * n);
  for (int i = 0; i < n; ++i) {
    const LD k = (static_cast<LD>(f2) - f1) * kPiL / n, x = (i * dt - static_cast<LD>(delay)) * kPiL;
    // The chirp's argument reaches 1e3 rad: its own rounding is a few eps of that.
    EXPECT_NEAR(chirp.y[i], amp * std::sin(i * (k * i + 2 * kPiL * f1)), 1e-12) << i;
    EXPECT_NEAR(sine.y[i], amp * std::sin((phase + 360.0L * cycles * i / n) * kPiL / 180), 1e-14) << i;
    EXPECT_NEAR(sinc.y[i], x == 0 ? amp : amp * std::sin(x) / x, 1e-15) << i;
  }
  EXPECT_EQ(sinc.y[18], amp);  // x exactly 0
}

TEST(GeneratePatterns, HandValues) {
  const auto square = [](int32_t n, double duty, double cycles) {
    double amp = 2;
    return Exec([=](F64ArrayHdl o, int32_t* e) mutable { return Square(o, &n, &amp, &duty, &cycles, e); }).y;
  };
  EXPECT_EQ(square(10, 50, 2), (V{2, 2, 2, 0, 0, 2, 2, 2, 0, 0}));  // period 5, 3 high
  EXPECT_EQ(square(7, 30, 2), (V{2, 0, 0, 0, 2, 0, 0}));            // period round(3.5) = 4
  EXPECT_EQ(square(5, 100, 1e-300), V(5, 2.0));                     // all high, no period needed
  EXPECT_EQ(square(6, 150, 1), V(6, 2.0));
  const auto ramp = [](int32_t n, double s, double e, int32_t mode, uint32_t scale) {
    return Exec([=](F64ArrayHdl o, int32_t*) { return RampPtrn85(o, n, s, e, mode, scale); }).y;
  };
  EXPECT_EQ(ramp(5, 0, 1, 0, 0), (V{0, 0.25, 0.5, 0.75, 1}));
  const V open = ramp(5, 1, 0, 7, 0);  // any mode but 0 stops short of the end
  ASSERT_EQ(open.size(), 5u);
  for (int i = 0; i < 5; ++i) EXPECT_NEAR(open[i], 1 - 0.2 * i, 1e-15);
  EXPECT_EQ(ramp(1, 3, 9, 1, 0), V{3});
  EXPECT_EQ(ramp(1, 4, 4, 0, 0), V{4});
  const V logRamp = ramp(4, 1, 1000, 0, 1);
  ASSERT_EQ(logRamp.size(), 4u);
  for (int i = 0; i < 4; ++i) EXPECT_NEAR(logRamp[i], std::pow(10.0, i), 1e-15 * std::pow(10.0, i));
  EXPECT_EQ(logRamp[3], 1000);  // the end point exactly
  EXPECT_EQ(Exec([](F64ArrayHdl o, int32_t*) { return RampPtrn80(o, 3, -1, 1, 0); }).y, (V{-1, 0, 1}));
  int32_t n = 3;
  double s = 2, e = -2;
  EXPECT_EQ(Exec([&](F64ArrayHdl o, int32_t* err) { return RampPtrn(o, &n, &s, &e, err); }).y, (V{2, 0, -2}));
  double amp = -1;
  int32_t delay = 2, width = 3, none = 0;
  EXPECT_EQ(Exec([&](F64ArrayHdl o, int32_t* err) { return ImpulsePtrn(o, &n, &amp, &delay, err); }).y,
            (V{0, 0, -1}));
  n = 6;
  EXPECT_EQ(Exec([&](F64ArrayHdl o, int32_t* err) { return PulsePtrn(o, &n, &amp, &delay, &width, err); }).y,
            (V{0, 0, -1, -1, -1, 0}));
  const Out empty = Exec([&](F64ArrayHdl o, int32_t* err) { return PulsePtrn(o, &n, &amp, &delay, &none, err); });
  EXPECT_EQ(empty.err, 0);
  EXPECT_EQ(empty.y, V(6, 0.0));
}

// ---- the pulses of form B ----------------------------------------------------------

TEST(GeneratePulses, GridAndGivenTimesMatchClosedForms) {
  const double amp = 1.75, dt = 0.01, delay = 0.4, fc = 3, bw = 0.5, att = 6, width = 0.5, skew = 0.3;
  const int32_t n = 120, order = 5;
  const auto triangle = [&](LD t) -> LD {  // t from the start of the pulse
    const LD peak = skew * width;
    return t < 0 || t > width ? 0 : t <= peak ? t * amp / peak : (width - t) * amp / (width - peak);
  };
  struct Pulse {
    const char* name;
    std::function<int32_t(F64ArrayHdl)> call;
    std::function<LD(LD)> want;   // at grid time t
    LD shift;                     // given times are shifted by this first
  };
  const std::vector<Pulse> pulses = {
      {"triangle", [&](F64ArrayHdl h) { return AperiodTriangleH(h, n, amp, delay, dt, width, skew); }, triangle, width / 2.0L},
      {"monopulse", [&](F64ArrayHdl h) { return GaussMonopulseH(h, n, dt, delay, fc, amp); },
       [&](LD t) { const LD u = t * fc * kPiL; return 2 * std::sqrt(std::exp(1.0L)) * amp * u * std::exp(-2 * u * u); }, 0},
      {"gauss", [&](F64ArrayHdl h) { return GaussPulseH(h, n, amp, delay, dt, fc, bw, att); },
       [&](LD t) { const LD u = t * fc * kPiL; return amp * std::exp(-5 * bw * bw / std::log(10.0L) / att * u * u) * std::cos(2 * u); }, 0},
      {"dirichlet", [&](F64ArrayHdl h) { return PeriodicSincH(h, n, amp, order, dt, delay); },
       [&](LD t) { return std::fabs(std::sin(t / 2)) < 1e-15 ? LD{amp} : amp * std::sin(order * t / 2) / (order * std::sin(t / 2)); }, 0},
  };
  V times;
  for (int i = 0; i < 9; ++i) times.push_back(-0.3 + 0.07 * i);
  times.push_back(4 * std::numbers::pi);  // a multiple of 2 pi: Dirichlet's 1
  for (const Pulse& p : pulses) {
    const Out grid = Exec([&](F64ArrayHdl h, int32_t*) { return p.call(h); }, {});
    ASSERT_EQ(grid.ret, 0) << p.name;
    ASSERT_EQ(grid.y.size(), static_cast<size_t>(n)) << p.name;
    for (int i = 0; i < n; ++i) EXPECT_NEAR(grid.y[i], p.want(i * static_cast<LD>(dt) - delay), 1e-14) << p.name << i;
    const Out given = Exec([&](F64ArrayHdl h, int32_t*) { return p.call(h); }, times);
    ASSERT_EQ(given.y.size(), times.size()) << p.name;
    for (size_t i = 0; i < times.size(); ++i) EXPECT_NEAR(given.y[i], p.want(times[i] + p.shift), 1e-14) << p.name << i;
  }
  // A symmetric triangle on given times is symmetric about time 0.
  const Out sym = Exec([](F64ArrayHdl h, int32_t*) { return AperiodTriangleH(h, 0, 1, 9, 1, 2, 0.5); },
                       {-1, -0.5, -0.25, 0, 0.25, 0.5, 1});
  EXPECT_EQ(sym.y, (V{0, 0.5, 0.75, 1, 0.75, 0.5, 0}));
}

// ---- checks, codes and failure paths ---------------------------------------------------

// Form A entries with scalars by pointer; fields not used by an entry are
// ignored.
struct Args {
  int32_t n = 8;
  double amp = 1, a = 0.1, b = 0.2, c = 30;
  int32_t i = 1, j = 1;
};
using Entry = std::function<int32_t(F64ArrayHdl, Args&, int32_t*)>;
struct Named { const char* name; Entry call; };
const F64 kPair{1, 2};
const std::vector<Named> kFormA = {
    {"sine", [](F64ArrayHdl o, Args& x, int32_t* e) { return SineWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"square wave", [](F64ArrayHdl o, Args& x, int32_t* e) { return SquareWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, &x.b, e); }},
    {"saw", [](F64ArrayHdl o, Args& x, int32_t* e) { return SawtoothWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"triangle", [](F64ArrayHdl o, Args& x, int32_t* e) { return TriangleWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"table", [](F64ArrayHdl o, Args& x, int32_t* e) { return ArbitraryWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, kPair.Handle(), &x.i, e); }},
    {"chirp", [](F64ArrayHdl o, Args& x, int32_t* e) { return ChirpCIN(o, &x.n, &x.amp, &x.a, &x.b, e); }},
    {"sine pattern", [](F64ArrayHdl o, Args& x, int32_t* e) { return SinePtrn(o, &x.n, &x.amp, &x.c, &x.b, e); }},
    {"square", [](F64ArrayHdl o, Args& x, int32_t* e) { return Square(o, &x.n, &x.amp, &x.c, &x.b, e); }},
    {"ramp", [](F64ArrayHdl o, Args& x, int32_t* e) { return RampPtrn(o, &x.n, &x.a, &x.b, e); }},
    {"impulse", [](F64ArrayHdl o, Args& x, int32_t* e) { return ImpulsePtrn(o, &x.n, &x.amp, &x.i, e); }},
    {"pulse", [](F64ArrayHdl o, Args& x, int32_t* e) { return PulsePtrn(o, &x.n, &x.amp, &x.i, &x.j, e); }},
    {"sinc", [](F64ArrayHdl o, Args& x, int32_t* e) { return SincWave(o, &x.n, &x.amp, &x.a, &x.b, e); }},
};

const Named& Find(const char* name) {
  for (const Named& e : kFormA)
    if (std::string(e.name) == name) return e;
  throw std::runtime_error(name);
}

TEST(GenerateChecks, FormACodesAndOrder) {
  struct Case { const char* entry; Args args; int32_t err; };
  const double inf = INFINITY;
  const std::vector<Case> cases = {
      {"sine", {.n = 0}, TSM_ERR_EMPTY},
      {"table", {.a = kNan}, TSM_ERR_NON_FINITE},
      {"table", {.c = -inf}, TSM_ERR_NON_FINITE},
      {"table", {.n = -1, .c = kNan}, TSM_ERR_EMPTY},
      {"chirp", {.n = -5}, TSM_ERR_EMPTY},
      {"ramp", {.n = 0}, TSM_ERR_EMPTY},
      {"ramp", {.n = 1, .a = 1, .b = 2}, TSM_ERR_COUNT_BELOW_2},
      {"ramp", {.n = 1, .a = 2, .b = 2}, 0},
      {"impulse", {.i = -1}, TSM_ERR_INDEX_RANGE},
      {"impulse", {.i = 8}, TSM_ERR_INDEX_RANGE},
      {"impulse", {.i = 7}, 0},
      {"impulse", {.n = 0, .i = 9}, TSM_ERR_EMPTY},
      {"pulse", {.i = -1, .j = 1}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 0, .j = 9}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 5, .j = 4}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 2147483647, .j = 2147483647}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 8, .j = 0}, 0},
      {"sinc", {.b = 0}, TSM_ERR_STEP_NOT_POSITIVE},
      {"sinc", {.b = kNan}, TSM_ERR_STEP_NOT_POSITIVE},
      // Square: every check runs, the last failure decides (c duty, b cycles).
      {"square", {.n = 0, .b = 1, .c = 50}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 0, .b = 0, .c = 0}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 8, .b = kNan, .c = kNan}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 8, .b = 1, .c = kNan}, TSM_ERR_DUTY_BELOW_ZERO},
      {"square", {.n = 8, .b = 2, .c = -1}, TSM_ERR_DUTY_BELOW_ZERO},
      {"square", {.n = 8, .b = 4.5, .c = -1}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 9, .b = 4.5, .c = 10}, TSM_ERR_DUTY_ABOVE_LIMIT},  // above the integer half
      {"square", {.n = 8, .b = 0, .c = 10}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 8, .b = 4, .c = 10}, 0},
  };
  for (const Case& c : cases) {
    Args args = c.args;
    const double phase = args.c;
    const Out r = Exec([&](F64ArrayHdl o, int32_t* e) { return Find(c.entry).call(o, args, e); });
    EXPECT_EQ(r.ret, 0) << c.entry;
    EXPECT_EQ(r.err, c.err) << c.entry << " n=" << c.args.n;
    EXPECT_EQ(r.y.size(), c.err != 0 ? 0u : static_cast<size_t>(c.args.n)) << c.entry;
    if (c.err != 0) {
      EXPECT_TRUE(std::isnan(phase) ? std::isnan(args.c) : args.c == phase) << "phase written";
    }
  }
}

TEST(GenerateChecks, FormBCodesAndOrder) {
  struct Case { const char* what; std::function<int32_t(F64ArrayHdl)> call; V xy; int32_t code; };
  const V t = {0.5, 1};
  const std::vector<Case> cases = {
      {"ramp85 open n0", [](F64ArrayHdl h) { return RampPtrn85(h, 0, 1, 2, 1, 9); }, {7}, TSM_ERR_ENDPOINT_COUNT},
      {"ramp85 closed n1", [](F64ArrayHdl h) { return RampPtrn85(h, 1, 1, 2, 0, 9); }, {7}, TSM_ERR_COUNT_BELOW_2},
      {"ramp85 closed n0", [](F64ArrayHdl h) { return RampPtrn85(h, 0, 2, 2, 0, 0); }, {7}, TSM_ERR_COUNT_BELOW_2},
      {"ramp85 scale", [](F64ArrayHdl h) { return RampPtrn85(h, 4, 1, 2, 0, 2); }, {7}, TSM_ERR_BAD_SELECTOR},
      {"ramp85 log", [](F64ArrayHdl h) { return RampPtrn85(h, 4, 0, 2, 0, 1); }, {7}, TSM_ERR_NOT_POSITIVE},
      {"ramp85 log end", [](F64ArrayHdl h) { return RampPtrn85(h, 4, 1, -2, -3, 1); }, {7}, TSM_ERR_NOT_POSITIVE},
      {"ramp80 open n0", [](F64ArrayHdl h) { return RampPtrn80(h, 0, 1, 2, -1); }, {7}, TSM_ERR_ENDPOINT_COUNT},
      {"triangle n", [](F64ArrayHdl h) { return AperiodTriangleH(h, 0, 1, 0, -1, -1, 2); }, {}, TSM_ERR_EMPTY},
      {"triangle width", [](F64ArrayHdl h) { return AperiodTriangleH(h, 0, 1, 0, -1, -1, 2); }, t, TSM_ERR_NOT_POSITIVE},
      {"triangle dt", [](F64ArrayHdl h) { return AperiodTriangleH(h, 5, 1, 0, 0, 1, 2); }, {}, TSM_ERR_STEP_NOT_POSITIVE},
      {"triangle dt given", [](F64ArrayHdl h) { return AperiodTriangleH(h, 0, 1, 0, 0, 1, 2); }, t, TSM_ERR_STEP_NOT_POSITIVE},
      {"triangle skew", [](F64ArrayHdl h) { return AperiodTriangleH(h, 5, 1, 0, 1, 1, 1.5); }, {}, TSM_ERR_PROBABILITY_RANGE},
      {"triangle skew NaN", [](F64ArrayHdl h) { return AperiodTriangleH(h, 0, 1, 0, 1, 1, kNan); }, t, TSM_ERR_PROBABILITY_RANGE},
      {"monopulse fc", [](F64ArrayHdl h) { return GaussMonopulseH(h, 0, -1, 0, 0, 1); }, {}, TSM_ERR_NOT_POSITIVE},
      {"monopulse n", [](F64ArrayHdl h) { return GaussMonopulseH(h, 0, -1, 0, 1, 1); }, {}, TSM_ERR_EMPTY},
      {"monopulse dt", [](F64ArrayHdl h) { return GaussMonopulseH(h, 0, -1, 0, 1, 1); }, t, TSM_ERR_STEP_NOT_POSITIVE},
      {"gauss bw", [](F64ArrayHdl h) { return GaussPulseH(h, 0, 1, 0, -1, 1, 0, 1); }, {}, TSM_ERR_NOT_POSITIVE},
      {"gauss att", [](F64ArrayHdl h) { return GaussPulseH(h, 4, 1, 0, 1, 1, 1, -6); }, t, TSM_ERR_NOT_POSITIVE},
      {"gauss n", [](F64ArrayHdl h) { return GaussPulseH(h, -2, 1, 0, -1, 1, 1, 6); }, {}, TSM_ERR_EMPTY},
      {"gauss dt", [](F64ArrayHdl h) { return GaussPulseH(h, 2, 1, 0, 0, 1, 1, 6); }, {}, TSM_ERR_STEP_NOT_POSITIVE},
      {"dirichlet order", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 0, -1, 0); }, {}, TSM_ERR_NOT_POSITIVE},
      {"dirichlet n", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 1, -1, 0); }, {}, TSM_ERR_EMPTY},
      {"dirichlet dt", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 1, -1, 0); }, t, TSM_ERR_STEP_NOT_POSITIVE},
      {"dirichlet given ignores n", [](F64ArrayHdl h) { return PeriodicSincH(h, -4, 1, 1, 1, 0); }, t, 0},
  };
  for (const Case& c : cases) {
    const Out r = Exec([&](F64ArrayHdl h, int32_t*) { return c.call(h); }, c.xy);
    EXPECT_EQ(r.ret, c.code) << c.what;
    EXPECT_EQ(r.y.size(), c.code != 0 ? 0u : c.xy.size()) << c.what;
  }
}

// Every resize that an entry makes fails in turn: -20001, an empty output,
// the caller's phase untouched and no block leaked.
TEST(GenerateChecks, RefusedResizes) {
  const int64_t blocks = tsrt_live_blocks();
  for (const Named& e : kFormA) {
    Args args;
    args.b = 4;  // cycles within Square's range
    F64 out{7, 7, 7};
    int32_t err = 0;
    const int made = RunFailingEachResize(
        [&] {
          out.SetCount(1);
          args.c = 30;
          return e.call(out.Handle(), args, &err);
        },
        [&](int k, int32_t ret) {
          EXPECT_EQ(ret, TSRT_MEMORY_FULL) << e.name << " resize " << k;
          EXPECT_EQ(err, TSM_ERR_NO_MEMORY) << e.name;
          EXPECT_EQ(out.Count(), 0) << e.name;
          EXPECT_EQ(args.c, 30) << e.name;
        });
    EXPECT_EQ(made, 1) << e.name;
    EXPECT_EQ(err, 0) << e.name;
    EXPECT_EQ(out.Count(), args.n) << e.name;
  }
  const std::vector<std::function<int32_t(F64ArrayHdl)>> formB = {
      [](F64ArrayHdl h) { return RampPtrn85(h, 4, 1, 2, 0, 1); },
      [](F64ArrayHdl h) { return RampPtrn80(h, 4, 1, 2, 1); },
      [](F64ArrayHdl h) { return AperiodTriangleH(h, 4, 1, 0, 1, 1, 0.5); },
      [](F64ArrayHdl h) { return GaussMonopulseH(h, 4, 1, 0, 1, 1); },
      [](F64ArrayHdl h) { return GaussPulseH(h, 4, 1, 0, 1, 1, 1, 6); },
      [](F64ArrayHdl h) { return PeriodicSincH(h, 4, 1, 3, 1, 0); },
  };
  for (size_t i = 0; i < formB.size(); ++i) {
    F64 out;
    const int made = RunFailingEachResize([&] { return formB[i](out.Handle()); },
                                          [&](int, int32_t ret) {
                                            EXPECT_EQ(ret, TSM_ERR_NO_MEMORY) << i;
                                            EXPECT_EQ(out.Count(), 0) << i;
                                          });
    EXPECT_EQ(made, 1) << i;
    EXPECT_EQ(out.Count(), 4) << i;
  }
  // Square sizes its output before it looks at its checks: a refused resize
  // wins over a bad duty cycle.
  {
    int32_t n = 8, err = 0;
    double amp = 1, duty = -1, cycles = 2;
    F64 out{7};
    tsrt_fail_resize_at(1);
    EXPECT_EQ(Square(out.Handle(), &n, &amp, &duty, &cycles, &err), TSRT_MEMORY_FULL);
    tsrt_fail_resize_at(0);
    EXPECT_EQ(err, TSM_ERR_NO_MEMORY);
    EXPECT_EQ(out.Count(), 0);
  }
  EXPECT_EQ(tsrt_live_blocks(), blocks);
}

}  // namespace
}  // namespace tsmtest
