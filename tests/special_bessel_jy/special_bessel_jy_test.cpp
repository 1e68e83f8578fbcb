// The Bessel J and Y entries against mpmath values made by
// tools/golden/special_bessel_jy_golden.py (tests/data/special_bessel_jy_*.txt),
// and the defined values at the edges of their domains.
//
// Each golden value carries its scale: the modulus sqrt(J^2 + Y^2) where the
// functions oscillate, the value itself where they are monotone (for negative
// non-integer orders the size of the two reflected terms). Results beyond the
// float64 range must be that infinity; results in the subnormal range count
// their rounding there as one eps.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <limits>
#include <string>
#include <vector>

#include "tsmath/tsmath.h"
#include "support/golden_rows.h"

namespace {

constexpr double kEps = 2.220446049250313e-16;
constexpr double kInf = INFINITY;
constexpr double kTol = 32 * kEps;

using Row = tsmtest::GoldenRow;

// The entries as functions of (order, x).
template <auto Entry, typename Order>
double Eval(Order v, double x) {
  double r;
  Entry(v, x, &r);
  return r;
}
constexpr auto J = Eval<TS_BesselJr, double>;
constexpr auto Y = Eval<TS_BesselYr, double>;
constexpr auto Js = Eval<TS_BesselJs, int32_t>;
constexpr auto Ys = Eval<TS_BesselYs, int32_t>;

// Error in units of kTol; an infinite reference wants exactly that infinity.
double Err(double got, double want, double scale) { return tsmtest::EnvelopeError(got, want, scale) / kTol; }

// Rows: order, x, first kind, second kind, their two scales; no second kind
// for x < 0 (scale 0).
template <typename Order>
void CheckFile(const char* file, double (*first)(Order, double), double (*second)(Order, double)) {
  const std::vector<Row> rows = tsmtest::LoadGoldenRows(file);
  const double worst = tsmtest::WorstGoldenError(file, rows, 1.0, [&](const Row& r) {
    const Order v = static_cast<Order>(r[0]);
    double e = Err(first(v, r[1]), r[2], r[4]);
    if (r[1] > 0) e = std::fmax(e, Err(second(v, r[1]), r[3], r[5]));
    return e;
  });
  std::printf("%s: %zu cases, worst error %.2f of 32 eps\n", file, rows.size(), worst);
}

TEST(BesselJY, RealOrderMatchesMpmath) { CheckFile<double>("special_bessel_jy_real.txt", J, Y); }

TEST(BesselJY, SphericalMatchesMpmath) { CheckFile<int32_t>("special_bessel_jy_spherical.txt", Js, Ys); }

TEST(BesselJY, DomainAndLimits) {
  const double nan = NAN;
  tsmtest::ExpectCases({
      // NaN in any argument, infinite orders
      {J(nan, 1), nan}, {J(1, nan), nan}, {Y(nan, 1), nan}, {Y(2.5, nan), nan}, {J(kInf, 1), nan},
      {Js(1, nan), nan}, {Ys(1, nan), nan},
      // negative x: integer orders by parity, others NaN; Y never
      {J(0.5, -1), nan}, {J(3, -2.5), -J(3, 2.5)}, {J(4, -2.5), J(4, 2.5)}, {Y(0, -1), nan}, {Y(2.5, -1), nan},
      // parity of integer orders, also beyond 2^14
      {J(-3, 7.5), -J(3, 7.5)}, {J(-16385, 2e4), -J(16385, 2e4)}, {J(-16386, 2e4), J(16386, 2e4)},
      {J(16387, -2e4), -J(16387, 2e4)}, {Y(-3, 7.5), -Y(3, 7.5)}, {Y(-4, 7.5), Y(4, 7.5)},
      // x = 0
      {J(0, 0), 1}, {J(2.5, 0), 0}, {J(-3, 0), 0}, {J(-0.5, 0), kInf}, {J(-1.5, 0), -kInf},
      {Y(0, 0), -kInf}, {Y(2.5, 0), -kInf}, {Y(-1, 0), kInf}, {Y(-2, 0), -kInf}, {Y(-0.5, 0), 0},
      {Y(-0.25, 0), -kInf}, {Js(0, 0), 1}, {Js(3, 0), 0}, {Ys(0, 0), -kInf}, {Ys(-1, 0), 1}, {Js(-1, 0), kInf},
      // x = +inf
      {J(0, kInf), 0}, {J(7.3, kInf), 0}, {Y(1, kInf), 0}, {Y(-2.5, kInf), 0}, {Js(4, kInf), 0},
      {Ys(4, kInf), 0}, {J(2, -kInf), 0}, {J(2.5, -kInf), nan},
      // orders within 1e-8 of an integer are that integer for Y only
      {Y(3 + 1e-9, 2.5), Y(3, 2.5)}, {Y(-3 - 1e-9, 2.5), Y(-3, 2.5)},
      // overflow of Y and of J of negative order
      {Y(200, 1e-3), -kInf}, {Y(-201, 1e-3), kInf}, {Y(200.5, 1e-3), -kInf}, {J(-200.5, 1e-3), kInf},
      {Ys(200, 1e-3), -kInf},
      // spherical orders below 0 and negative x
      {Js(-1, 2.5), -Ys(0, 2.5)}, {Ys(-2, 2.5), -Js(1, 2.5)}, {Js(3, -2.5), -Js(3, 2.5)},
      {Ys(3, -2.5), Ys(3, 2.5)},
  });
  // Y off an integer by more than 1e-8 is not rounded to it; the parity
  // cases above are not zeros
  EXPECT_NE(Y(3 + 1e-7, 2.5), Y(3, 2.5));
  EXPECT_GT(std::fabs(J(16385, 2e4)), 1e-3);
  // tiny arguments keep full range: j_n(x) ~ x^n/(2n+1)!! stays normal while
  // J_(n+1/2) underflows
  EXPECT_NEAR(Js(1, 1e-300) / 1e-300, 1.0 / 3, 1e-16);
}

}  // namespace
