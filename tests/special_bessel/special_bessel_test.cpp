// The Bessel-family entries against mpmath values made by
// tools/golden/special_bessel_golden.py (tests/data/special_bessel_*.txt), and
// the defined values at the edges of their domains.
//
// Errors are taken relative to each function's envelope: where it oscillates
// (Airy for x < 0) the modulus sqrt(Ai^2 + Bi^2), so that values near a zero
// are judged against the size of the wave. Airy's zeta = 2/3 |x|^(3/2) is
// itself rounded, an error of about zeta eps in the phase or the exponent that
// no evaluation in doubles avoids: the tolerance grows with it.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <limits>
#include <string>
#include <vector>

#include "tsmath/tsmath.h"
#include "support/golden_rows.h"

namespace {

constexpr double kEps = 2.220446049250313e-16;
constexpr double kInf = INFINITY;
constexpr double kMax = std::numeric_limits<double>::max();

using Row = tsmtest::GoldenRow;

std::vector<Row> Load(const std::string& name) { return tsmtest::LoadGoldenRows("special_bessel_" + name + ".txt"); }

using tsmtest::EnvelopeError;

// One golden file: `check` returns the error of one row in units of its own
// allowance; all must stay at or below 1.
struct GoldenCase {
  const char* file;
  std::function<double(const Row&)> check;
};

class Golden : public ::testing::TestWithParam<GoldenCase> {};

TEST_P(Golden, MatchesMpmath) {
  const GoldenCase& c = GetParam();
  const std::vector<Row> rows = Load(c.file);
  const double worst = tsmtest::WorstGoldenError(c.file, rows, 1.0, c.check);
  std::printf("%-12s %zu cases, worst error %.2f of its allowance\n", c.file, rows.size(), worst);
}

// 16 eps, plus 2 zeta eps for the rounding of zeta in the phase or the
// exponential (the functions' own condition number is 3/2 zeta). On
// (0, 2.09) Ai and Ai' come from the Maclaurin series as c1 f - c2 g, a
// difference of terms of size Bi/sqrt 3 (Bi'/sqrt 3): that is their scale.
double AiryError(const Row& r) {
  const double x = r[0];
  double v[4];
  TS_Airy(x, &v[0], &v[1], &v[2], &v[3]);
  double m = 0, n = 0, ma = 0, na = 0;
  if (x < 0) {
    m = ma = std::hypot(r[1], r[3]);
    n = na = std::hypot(r[2], r[4]);
  } else if (x < 2.09) {
    ma = r[3] / std::sqrt(3.0);
    na = r[4] / std::sqrt(3.0);
  }
  const double e = std::fmax(std::fmax(EnvelopeError(v[0], r[1], ma), EnvelopeError(v[2], r[3], m)),
                             std::fmax(EnvelopeError(v[1], r[2], na), EnvelopeError(v[3], r[4], n)));
  const double zeta = 2.0 / 3 * std::pow(std::fabs(x), 1.5);
  return e / ((16 + 2 * zeta) * kEps);
}

// 16 eps of the scale of the series terms that cancel: I_n(|x|) for ber and
// bei, that times (2 + |ln(x/2)| + ln(|n| + x + 2)) for ker and kei (see
// special/kelvin.cpp); below it, of the modulus.
double KelvinError(const Row& r) {
  const int32_t n = static_cast<int32_t>(r[0]);
  const double x = r[1], in = r[6];
  double a, b;
  TS_KelvinI(x, n, &a, &b);
  const double m = std::fmax(std::hypot(r[2], r[3]), in);
  double e = std::fmax(EnvelopeError(a, r[2], m), EnvelopeError(b, r[3], m));
  if (x > 0) {
    TS_KelvinK(x, n, &a, &b);
    const double k = std::fmax(std::hypot(r[4], r[5]),
                               (2 + std::fabs(std::log(x / 2)) + std::log(std::abs(n) + x + 2)) * in);
    e = std::fmax(e, std::fmax(EnvelopeError(a, r[4], k), EnvelopeError(b, r[5], k)));
  }
  return e / (16 * kEps);
}

// Relative, 16 eps for K0 and K1 and a few more roundings per step of the
// recurrence, which is stable upward.
double KnError(const Row& r) {
  const int32_t n = static_cast<int32_t>(r[0]);
  double v;
  TS_BesselKn(n, r[1], &v);
  return EnvelopeError(v, r[2], 0) / ((16 + std::abs(n)) * kEps);
}

// 16 eps of the envelope the golden file carries: the modulus of J_v and Y_v
// where H_v oscillates with them, |H_v| elsewhere.
double StruveError(const Row& r) {
  double h;
  TS_Struve(r[1], r[0], &h);
  return EnvelopeError(h, r[2], r[3]) / (16 * kEps);
}

INSTANTIATE_TEST_SUITE_P(Kernels, Golden,
                         ::testing::Values(GoldenCase{"airy", AiryError}, GoldenCase{"kelvin", KelvinError},
                                           GoldenCase{"kn", KnError}, GoldenCase{"struve", StruveError}),
                         [](const auto& info) { return std::string(info.param.file); });

using tsmtest::ExpectCases;

TEST(Airy, Limits) {
  std::vector<std::pair<double, double>> cases;
  const std::pair<double, std::vector<double>> table[] = {
      {NAN, {NAN, NAN, NAN, NAN}},
      {kInf, {0, 0, kInf, kInf}},
      {std::nextafter(103.892, kInf), {0, 0, kMax, kMax}},
      {1e300, {0, 0, kMax, kMax}},
      {-kInf, {0, NAN, 0, NAN}},
  };
  for (const auto& [x, want] : table) {
    double v[4];
    TS_Airy(x, &v[0], &v[1], &v[2], &v[3]);
    for (int k = 0; k < 4; ++k) cases.push_back({v[k], want[k]});
  }
  ExpectCases(cases);
  // Just below the cut the values are still finite and Bi grows without bound.
  double ai, aip, bi, bip;
  TS_Airy(103.892, &ai, &aip, &bi, &bip);
  EXPECT_GT(ai, 0);
  EXPECT_TRUE(std::isfinite(bi) && bi > 1e300);
}

TEST(BesselKn, Limits) {
  auto k = [](int32_t n, double x) {
    double v;
    TS_BesselKn(n, x, &v);
    return v;
  };
  ExpectCases({{k(0, 0), kInf}, {k(3, 0), kInf}, {k(1, -1), NAN}, {k(2, NAN), NAN}, {k(0, kInf), 0},
               {k(200, 1e-3), kInf},  // overflow in the recurrence
               {k(-4, 3.5), k(4, 3.5)}});
}

TEST(Struve, Limits) {
  constexpr double kTwoOverPi = 0.6366197723675814;
  auto h = [](double v, double x) {
    double r;
    TS_Struve(x, v, &r);
    return r;
  };
  ExpectCases({{h(0, 0), 0}, {h(-1, 0), kTwoOverPi}, {h(-2.3, 0), -kInf}, {h(-3.3, 0), kInf},
               {h(0.5, kInf), 0}, {h(1, kInf), kTwoOverPi}, {h(2, kInf), kInf},
               {h(2.5, -1), NAN}, {h(NAN, 1), NAN}, {h(1, NAN), NAN},
               // integer orders: H_v(-x) = (-1)^(v+1) H_v(x)
               {h(2, -3.5), -h(2, 3.5)}, {h(1, -3.5), h(1, 3.5)}, {h(-3, -40), h(-3, 40)}});
}

TEST(Kelvin, Limits) {
  constexpr double kQuarterPi = 0.7853981633974483;
  std::vector<std::pair<double, double>> cases;
  const struct {
    double x;
    int32_t n;
    double ber, bei, ker, kei;
  } table[] = {
      {0, 0, 1, 0, kInf, -kQuarterPi},  // ker_0 has a log singularity, kei_0(0) = -pi/4
      {0, 3, 0, 0, NAN, NAN},
      {-1, 0, NAN, NAN, NAN, NAN},  // only ker, kei refuse x < 0: ber, bei not checked here
      {NAN, 2, NAN, NAN, NAN, NAN},
  };
  for (const auto& t : table) {
    double ber, bei, ker, kei;
    TS_KelvinI(t.x, t.n, &ber, &bei);
    TS_KelvinK(t.x, t.n, &ker, &kei);
    if (t.x >= 0 || std::isnan(t.x)) {
      cases.push_back({ber, t.ber});
      cases.push_back({bei, t.bei});
    }
    cases.push_back({ker, t.ker});
    cases.push_back({kei, t.kei});
  }
  ExpectCases(cases);
}

}  // namespace
