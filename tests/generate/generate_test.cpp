// The waveform generators through host handles: values and the phase carried
// out against closed forms evaluated directly in long double, every check with
// its code and order, and the failure paths.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <numbers>
#include <string>
#include <vector>

#include "support/host_arrays.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using LD = long double;
constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
constexpr LD kPiL = std::numbers::pi_v<LD>;
// Every resize moves the block: an entry that kept a pointer across one fails.
const bool gMoving = (tsrt_always_move(1), true);

struct Out {
  int32_t ret, err;
  V y;
};
using Call = std::function<int32_t(F64ArrayHdl, int32_t*)>;

// One call with an output holding stale values (or the given times).
Out Exec(const Call& f, const V& init = {7, 7, 7}) {
  F64 out(init);
  Out r{-1, 0x5A5A5A5A, {}};
  r.ret = f(out.Handle(), &r.err);
  r.y = out.Values();
  return r;
}

// The form A entries over one set of scalars: n, amp, a (frequency, start,
// f1, delay), b (duty of the square wave, cycles, end, f2, dt), c (phase, or
// Square's duty), i (interp, delay), j (width).
struct Args {
  int32_t n = 8;
  double amp = 1, a = 0.1, b = 4, c = 30;
  int32_t i = 1, j = 1;
};
const F64 kTable{0, 1, 4, 9, -2};
const std::vector<std::pair<std::string, std::function<int32_t(F64ArrayHdl, Args&, int32_t*)>>> kFormA = {
    {"sine", [](F64ArrayHdl o, Args& x, int32_t* e) { return SineWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"square wave", [](F64ArrayHdl o, Args& x, int32_t* e) { return SquareWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, &x.b, e); }},
    {"saw", [](F64ArrayHdl o, Args& x, int32_t* e) { return SawtoothWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"triangle", [](F64ArrayHdl o, Args& x, int32_t* e) { return TriangleWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, e); }},
    {"table", [](F64ArrayHdl o, Args& x, int32_t* e) { return ArbitraryWaveCIN(o, &x.n, &x.amp, &x.a, &x.c, kTable.Handle(), &x.i, e); }},
    {"chirp", [](F64ArrayHdl o, Args& x, int32_t* e) { return ChirpCIN(o, &x.n, &x.amp, &x.a, &x.b, e); }},
    {"sine pattern", [](F64ArrayHdl o, Args& x, int32_t* e) { return SinePtrn(o, &x.n, &x.amp, &x.c, &x.b, e); }},
    {"square", [](F64ArrayHdl o, Args& x, int32_t* e) { return Square(o, &x.n, &x.amp, &x.c, &x.b, e); }},
    {"ramp", [](F64ArrayHdl o, Args& x, int32_t* e) { return RampPtrn(o, &x.n, &x.a, &x.b, e); }},
    {"impulse", [](F64ArrayHdl o, Args& x, int32_t* e) { return ImpulsePtrn(o, &x.n, &x.amp, &x.i, e); }},
    {"pulse", [](F64ArrayHdl o, Args& x, int32_t* e) { return PulsePtrn(o, &x.n, &x.amp, &x.i, &x.j, e); }},
    {"sinc", [](F64ArrayHdl o, Args& x, int32_t* e) { return SincWave(o, &x.n, &x.amp, &x.a, &x.b, e); }},
};
Out ExecA(const std::string& name, Args& x) {
  const auto it = std::find_if(kFormA.begin(), kFormA.end(), [&](const auto& e) { return e.first == name; });
  return Exec([&](F64ArrayHdl o, int32_t* e) { return it->second(o, x, e); });
}

// Degrees of a wave at sample i, phase + 360 frac(f i) wrapped, with f*i
// split exactly into its rounded value and its error.
LD DegreesAt(double phase, double f, double i) {
  const double p = f * i, e = std::fma(f, i, -p);
  const LD d = std::fmod(phase + 360 * ((static_cast<LD>(p) - std::floor(p)) + e), 360.0L);
  return d < 0 ? d + 360 : d;
}

// A wave of unit amplitude at x degrees; NaN within 1e-9 degrees of a jump,
// where a sample may fall on either side.
LD Shape(const std::string& w, LD x, double duty) {
  const auto near = [&](LD at) { return std::fabs(x - at) < 1e-9L || std::fabs(x - at - 360) < 1e-9L; };
  if (w == "sine") return std::sin(x * kPiL / 180);
  if (w == "square wave") return near(0) || near(duty * 3.6L) ? NAN : x < duty * 3.6L ? 1 : -1;
  if (w == "saw") return near(180) ? NAN : x < 180 ? x / 180 : x / 180 - 2;
  if (w == "triangle") return x < 90 ? x / 90 : x < 270 ? 2 - x / 90 : x / 90 - 4;
  const V t = kTable.Values();  // linear interpolation, cyclic
  const LD r = x * 5 / 360;
  const int k = static_cast<int>(r);
  return t[k] + (r - k) * (t[(k + 1) % 5] - t[k]);
}

// ---- the continuous waves ------------------------------------------------------

TEST(GenerateWaves, MatchClosedFormsAndCarryThePhase) {
  struct Case { const char* w; int32_t n; double amp, f, phase, duty = 0; };
  const std::vector<Case> cases = {
      {"sine", 1000000, 2.5, 1e-4, 37.5},     {"sine", 1000000, -1.5, 0.0123, -100},
      {"sine", 1000000, 1, 0.1, 725},         {"sine", 1000000, 3, 0.3, 359.9},
      {"sine", 1000000, 1, 0.4571, 0},        {"sine", 100000, 1, -1.2345, 12},
      {"sine", 1, 2, 0.3, 90},                {"sine", 2, 2, 0.25, 90},
      {"sine", 55, 0, 0.1, 30},               {"square wave", 100000, 2, 0.0371, -50, 37},
      {"square wave", 3000, 1, 0.01, 0, 150}, {"square wave", 3000, 1, 0.01, 0, -1},
      {"saw", 100000, 1.5, 0.0371, -50},      {"saw", 1000, 1, -0.3, 1e6},
      {"triangle", 100000, 2, 0.0371, 400},   {"table", 100000, 2, 0.0371, -50},
  };
  for (const Case& c : cases) {
    Args x{.n = c.n, .amp = c.amp, .a = c.f, .b = c.duty, .c = c.phase};
    const Out r = ExecA(c.w, x);
    ASSERT_EQ(r.err, 0);
    ASSERT_EQ(r.y.size(), static_cast<size_t>(c.n));
    LD worst = 0;
    for (int32_t i = 0; i < c.n; ++i) {
      const LD want = c.amp * Shape(c.w, DegreesAt(c.phase, c.f, i), std::clamp(c.duty, 0.0, 100.0));
      if (!std::isnan(want)) worst = std::max(worst, std::fabs(r.y[i] - want));
    }
    EXPECT_LE(worst, 1e-12L * std::fabs(c.amp)) << c.w << " f=" << c.f;
    EXPECT_NEAR(x.c, static_cast<double>(DegreesAt(c.phase, c.f, c.n)), 1e-11) << c.w << " f=" << c.f;
  }
  // Near a quarter of the sample rate the recurrence is barely stable and
  // drifts past amp: the clipping holds it within |amp|.
  Args quarter{.n = 1000000, .amp = -2, .a = 0.2499999, .c = 10};
  for (double v : ExecA("sine", quarter).y) ASSERT_LE(std::fabs(v), 2.0);
  // Without interpolation the table steps: 18 degrees a sample, 72 an entry.
  Args x{.n = 10, .amp = -1, .a = 0.05, .c = 10, .i = 0};
  EXPECT_EQ(ExecA("table", x).y, (V{0, 0, 0, 0, -1, -1, -1, -1, -4, -4}));
  // An empty table gives zeros and phase 0.
  double amp = 3, f = 0.1, phase = 45;
  int32_t n = 4, interp = 1;
  F64 empty;
  EXPECT_EQ(Exec([&](F64ArrayHdl o, int32_t* e) { return ArbitraryWaveCIN(o, &n, &amp, &f, &phase, empty.Handle(), &interp, e); }).y,
            V(4, 0.0));
  EXPECT_EQ(phase, 0.0);
}

// ---- patterns ------------------------------------------------------------------

TEST(GeneratePatterns, ChirpSineAndSincMatchClosedForms) {
  Args chirp{.n = 1000, .amp = 1.5, .a = 0.01, .b = 0.4}, sine{.n = 1000, .amp = 1.5, .b = 3.5, .c = -30},
      sinc{.n = 1000, .amp = 1.5, .a = 2.25, .b = 0.125};
  const V yc = ExecA("chirp", chirp).y, ys = ExecA("sine pattern", sine).y, yz = ExecA("sinc", sinc).y;
  EXPECT_EQ(sine.c, -30);  // only read
  ASSERT_EQ(yc.size() + ys.size() + yz.size(), 3000u);
  for (int i = 0; i < 1000; ++i) {
    const LD k = (static_cast<LD>(0.4) - 0.01) * kPiL / 1000, x = (i * 0.125L - 2.25L) * kPiL;
    // The chirp's argument reaches 1e3 rad, a few eps of which is its own rounding.
    EXPECT_NEAR(yc[i], 1.5L * std::sin(i * (k * i + 2 * kPiL * 0.01)), 1e-12) << i;
    EXPECT_NEAR(ys[i], 1.5L * std::sin((-30 + 360.0L * 3.5 * i / 1000) * kPiL / 180), 1e-14) << i;
    EXPECT_NEAR(yz[i], x == 0 ? 1.5L : 1.5L * std::sin(x) / x, 1e-15) << i;
  }
  EXPECT_EQ(yz[18], 1.5);  // x exactly 0
}

TEST(GeneratePatterns, HandValues) {
  struct Case { const char* entry; Args x; V want; };
  const std::vector<Case> cases = {
      {"square", {.n = 10, .amp = 2, .b = 2, .c = 50}, {2, 2, 2, 0, 0, 2, 2, 2, 0, 0}},  // period 5, 3 high
      {"square", {.n = 7, .amp = 2, .b = 2, .c = 30}, {2, 0, 0, 0, 2, 0, 0}},           // period round(3.5)
      {"square", {.n = 5, .amp = 2, .b = 1e-300, .c = 100}, V(5, 2.0)},                  // no period needed
      {"square", {.n = 6, .amp = 2, .b = 1, .c = 150}, V(6, 2.0)},
      {"ramp", {.n = 3, .a = 2, .b = -2}, {2, 0, -2}},
      {"ramp", {.n = 1, .a = 4, .b = 4}, {4}},
      {"impulse", {.n = 3, .amp = -1, .i = 2}, {0, 0, -1}},
      {"pulse", {.n = 6, .amp = -1, .i = 2, .j = 3}, {0, 0, -1, -1, -1, 0}},
      {"pulse", {.n = 3, .amp = -1, .i = 3, .j = 0}, {0, 0, 0}},
  };
  for (Case c : cases) EXPECT_EQ(ExecA(c.entry, c.x).y, c.want) << c.entry << " n=" << c.x.n;
  const auto ramp = [](int32_t n, double s, double e, int32_t mode, uint32_t scale) {
    return Exec([=](F64ArrayHdl o, int32_t*) { return RampPtrn85(o, n, s, e, mode, scale); }).y;
  };
  EXPECT_EQ(ramp(5, 0, 1, 0, 0), (V{0, 0.25, 0.5, 0.75, 1}));
  EXPECT_EQ(ramp(1, 3, 9, 1, 0), V{3});
  EXPECT_EQ(Exec([](F64ArrayHdl o, int32_t*) { return RampPtrn80(o, 3, -1, 1, 0); }).y, (V{-1, 0, 1}));
  const V open = ramp(5, 1, 0, 7, 0), log = ramp(4, 1, 1000, 0, 1);  // any mode but 0 stops short
  ASSERT_EQ(open.size() + log.size(), 9u);
  for (int i = 0; i < 5; ++i) EXPECT_NEAR(open[i], 1 - 0.2 * i, 1e-15);
  for (int i = 0; i < 4; ++i) EXPECT_NEAR(log[i], std::pow(10.0, i), 1e-15 * std::pow(10.0, i));
  EXPECT_EQ(log[3], 1000);  // the end point exactly
}

// ---- the pulses of form B ----------------------------------------------------------

TEST(GeneratePulses, GridAndGivenTimesMatchClosedForms) {
  const double amp = 1.75, dt = 0.01, delay = 0.4, fc = 3, bw = 0.5, att = 6, width = 0.5, skew = 0.3;
  const int32_t n = 120, order = 5;
  struct Pulse { const char* name; std::function<int32_t(F64ArrayHdl)> call; std::function<LD(LD)> want; LD shift; };
  const LD peak = skew * width, e = std::exp(1.0L);
  const std::vector<Pulse> pulses = {
      {"triangle", [&](F64ArrayHdl h) { return AperiodTriangleH(h, n, amp, delay, dt, width, skew); },
       [&](LD t) -> LD { return t < 0 || t > width ? 0 : t <= peak ? t * amp / peak : (width - t) * amp / (width - peak); },
       width / 2.0L},  // given times are centred on 0
      {"monopulse", [&](F64ArrayHdl h) { return GaussMonopulseH(h, n, dt, delay, fc, amp); },
       [&](LD t) { const LD u = t * fc * kPiL; return 2 * std::sqrt(e) * amp * u * std::exp(-2 * u * u); }, 0},
      {"gauss", [&](F64ArrayHdl h) { return GaussPulseH(h, n, amp, delay, dt, fc, bw, att); },
       [&](LD t) { const LD u = t * fc * kPiL; return amp * std::exp(-5 * bw * bw / std::log(10.0L) / att * u * u) * std::cos(2 * u); }, 0},
      {"dirichlet", [&](F64ArrayHdl h) { return PeriodicSincH(h, n, amp, order, dt, delay); },
       [&](LD t) { const LD s = std::sin(t / 2); return std::fabs(s) < 1e-15 ? LD{amp} : amp * std::sin(order * t / 2) / (order * s); }, 0},
  };
  V times;
  for (int i = 0; i < 9; ++i) times.push_back(-0.3 + 0.07 * i);
  times.push_back(4 * std::numbers::pi);  // sin(x) rounds to 2e-16 there: Dirichlet's 1
  for (const Pulse& p : pulses) {
    const Out grid = Exec([&](F64ArrayHdl h, int32_t*) { return p.call(h); }, {});
    ASSERT_EQ(grid.y.size(), static_cast<size_t>(n)) << p.name;
    for (int i = 0; i < n; ++i) EXPECT_NEAR(grid.y[i], p.want(i * static_cast<LD>(dt) - delay), 1e-14) << p.name << i;
    const Out given = Exec([&](F64ArrayHdl h, int32_t*) { return p.call(h); }, times);
    ASSERT_EQ(given.y.size(), times.size()) << p.name;
    for (size_t i = 0; i < times.size(); ++i) EXPECT_NEAR(given.y[i], p.want(times[i] + p.shift), 1e-14) << p.name << i;
  }
  const Out sym = Exec([](F64ArrayHdl h, int32_t*) { return AperiodTriangleH(h, 0, 1, 9, 1, 2, 0.5); },
                       {-1, -0.5, -0.25, 0, 0.25, 0.5, 1});
  EXPECT_EQ(sym.y, (V{0, 0.5, 0.75, 1, 0.75, 0.5, 0}));
}

// ---- checks, codes and failure paths ---------------------------------------------------

TEST(GenerateChecks, FormACodesAndOrder) {
  struct Case { const char* entry; Args x; int32_t err; };
  const std::vector<Case> cases = {
      {"sine", {.n = 0}, TSM_ERR_EMPTY},
      {"table", {.a = kNan}, TSM_ERR_NON_FINITE},
      {"table", {.c = -INFINITY}, TSM_ERR_NON_FINITE},
      {"table", {.n = -1, .c = kNan}, TSM_ERR_EMPTY},
      {"ramp", {.n = 0}, TSM_ERR_EMPTY},
      {"ramp", {.n = 1, .a = 1, .b = 2}, TSM_ERR_COUNT_BELOW_2},
      {"impulse", {.i = -1}, TSM_ERR_INDEX_RANGE},
      {"impulse", {.i = 8}, TSM_ERR_INDEX_RANGE},
      {"impulse", {.n = 0, .i = 9}, TSM_ERR_EMPTY},
      {"pulse", {.i = -1, .j = 1}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 0, .j = 9}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 5, .j = 4}, TSM_ERR_PULSE_FIT},
      {"pulse", {.i = 2147483647, .j = 2147483647}, TSM_ERR_PULSE_FIT},
      {"sinc", {.b = 0}, TSM_ERR_STEP_NOT_POSITIVE},
      {"sinc", {.b = kNan}, TSM_ERR_STEP_NOT_POSITIVE},
      // Square runs every check and the last failure decides (b cycles, c duty).
      {"square", {.n = 0, .b = 1, .c = 50}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 8, .b = 2, .c = -1}, TSM_ERR_DUTY_BELOW_ZERO},
      {"square", {.n = 8, .b = 1, .c = kNan}, TSM_ERR_DUTY_BELOW_ZERO},
      {"square", {.n = 8, .b = 4.5, .c = -1}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 9, .b = 4.5, .c = 10}, TSM_ERR_DUTY_ABOVE_LIMIT},  // above the integer half
      {"square", {.n = 8, .b = 0, .c = 10}, TSM_ERR_DUTY_ABOVE_LIMIT},
      {"square", {.n = 8, .b = kNan, .c = 10}, TSM_ERR_DUTY_ABOVE_LIMIT},
  };
  for (const Case& c : cases) {
    Args x = c.x;
    const Out r = ExecA(c.entry, x);
    EXPECT_EQ(r.ret, 0) << c.entry;
    EXPECT_EQ(r.err, c.err) << c.entry << " n=" << c.x.n;
    EXPECT_EQ(r.y.size(), 0u) << c.entry;
    EXPECT_TRUE(x.c == c.x.c || std::isnan(c.x.c)) << c.entry << ": phase written on a failure";
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
      {"ramp85 log start", [](F64ArrayHdl h) { return RampPtrn85(h, 4, 0, 2, 0, 1); }, {7}, TSM_ERR_NOT_POSITIVE},
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
      {"monopulse dt given", [](F64ArrayHdl h) { return GaussMonopulseH(h, 0, -1, 0, 1, 1); }, t, TSM_ERR_STEP_NOT_POSITIVE},
      {"gauss bw", [](F64ArrayHdl h) { return GaussPulseH(h, 0, 1, 0, -1, 1, 0, 1); }, {}, TSM_ERR_NOT_POSITIVE},
      {"gauss att", [](F64ArrayHdl h) { return GaussPulseH(h, 4, 1, 0, 1, 1, 1, -6); }, t, TSM_ERR_NOT_POSITIVE},
      {"gauss n", [](F64ArrayHdl h) { return GaussPulseH(h, -2, 1, 0, -1, 1, 1, 6); }, {}, TSM_ERR_EMPTY},
      {"gauss dt", [](F64ArrayHdl h) { return GaussPulseH(h, 2, 1, 0, 0, 1, 1, 6); }, {}, TSM_ERR_STEP_NOT_POSITIVE},
      {"dirichlet order", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 0, -1, 0); }, {}, TSM_ERR_NOT_POSITIVE},
      {"dirichlet n", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 1, -1, 0); }, {}, TSM_ERR_EMPTY},
      {"dirichlet dt given", [](F64ArrayHdl h) { return PeriodicSincH(h, 0, 1, 1, -1, 0); }, t, TSM_ERR_STEP_NOT_POSITIVE},
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
  for (const auto& [name, call] : kFormA) {
    Args x;
    F64 out{7, 7, 7};
    int32_t err = 0;
    const auto run = [&] {
      out.SetCount(1);
      x.c = 30;
      return call(out.Handle(), x, &err);
    };
    const int made = RunFailingEachResize(run, [&](int k, int32_t ret) {
      EXPECT_EQ(ret, TSRT_MEMORY_FULL) << name << " resize " << k;
      EXPECT_EQ(err, TSM_ERR_NO_MEMORY) << name;
      EXPECT_EQ(out.Count(), 0) << name;
      EXPECT_EQ(x.c, 30) << name;
    });
    EXPECT_EQ(made, 1) << name;
    EXPECT_EQ(err, 0) << name;
    EXPECT_EQ(out.Count(), x.n) << name;
    if (name == "square") {  // sized before the checks are looked at: the refusal wins
      x.c = -1;
      tsrt_fail_resize_at(1);
      EXPECT_EQ(run(), TSRT_MEMORY_FULL);
      tsrt_fail_resize_at(0);
      EXPECT_EQ(err, TSM_ERR_NO_MEMORY);
    }
  }
  // Form B: a ramp and a pulse stand for the rest, which share their frame.
  for (const auto& call : std::vector<std::function<int32_t(F64ArrayHdl)>>{
           [](F64ArrayHdl h) { return RampPtrn85(h, 4, 1, 2, 0, 1); },
           [](F64ArrayHdl h) { return GaussPulseH(h, 4, 1, 0, 1, 1, 1, 6); }}) {
    F64 out;
    const int made = RunFailingEachResize([&] { return call(out.Handle()); }, [&](int, int32_t ret) {
      EXPECT_EQ(ret, TSM_ERR_NO_MEMORY);
      EXPECT_EQ(out.Count(), 0);
    });
    EXPECT_EQ(made, 1);
    EXPECT_EQ(out.Count(), 4);
  }
  EXPECT_EQ(tsrt_live_blocks(), blocks);
}

}  // namespace
}  // namespace tsmtest
