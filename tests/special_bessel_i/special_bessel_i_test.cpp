// Bessel I of real order and the parabolic cylinder function through their
// entries, against mpmath values made by tools/golden/special_bessel_i_golden.py
// (tests/data/special_bessel_i_*.txt), and the defined values at the edges of
// their domains.
//
// Errors are taken relative to the envelope the golden file gives for each
// case (|f| where the function is monotone; the size of the terms that make
// it up where it has zeros), so that values near a zero are judged against
// the size of the function around it.
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

double Iv(double v, double x) {
  double r;
  TS_BesselIr(v, x, &r);
  return r;
}

double Dv(double v, double x) {
  double r;
  TS_ParabolicCylinder(x, v, &r);  // value first, order second
  return r;
}

struct GoldenCase {
  const char* file;
  double (*f)(double, double);
};

class Golden : public ::testing::TestWithParam<GoldenCase> {};

// Rows: v x f(v, x) envelope. 24 eps of the envelope: the series and the
// integration run in long double, what is left is the rounding of the
// prefactors (pow, exp, Gamma) and of the 2F0 sums.
TEST_P(Golden, MatchesMpmath) {
  const GoldenCase& c = GetParam();
  const std::string file = std::string("special_bessel_i_") + c.file + ".txt";
  const auto rows = tsmtest::LoadGoldenRows(file);
  const double worst = tsmtest::WorstGoldenError(file, rows, 1.0, [&](const tsmtest::GoldenRow& r) {
    const double got = c.f(r[0], r[1]);
    return tsmtest::EnvelopeError(got, r[2], r[3]) / (24 * kEps);
  });
  std::printf("%-6s %zu cases, worst error %.2f of its allowance\n", c.file, rows.size(), worst);
}

INSTANTIATE_TEST_SUITE_P(Kernels, Golden, ::testing::Values(GoldenCase{"iv", Iv}, GoldenCase{"pcfd", Dv}),
                         [](const auto& info) { return std::string(info.param.file); });

TEST(BesselIr, DomainAndLimits) {
  tsmtest::ExpectCases({
      {Iv(0, 0), 1},
      {Iv(2.5, 0), 0},
      {Iv(-0.5, 0), kInf},  // singular
      {Iv(1.5, -1), NAN},   // non-integer order, negative x
      {Iv(NAN, 1), NAN},
      {Iv(1, NAN), NAN},
      {Iv(kInf, 1), NAN},
      {Iv(3, -2), -Iv(3, 2)},  // I_n(-x) = (-1)^n I_n(x)
      {Iv(4, -2), Iv(4, 2)},
      {Iv(-3, 2.5), Iv(3, 2.5)},  // I_-n = I_n
      {Iv(0, kInf), kInf},
      {Iv(3, -kInf), -kInf},
      {Iv(0, 720), kInf},  // overflow
      {Iv(100, 1e-6), 0},  // underflow
      {Iv(-50.5, 1e-6), kInf},
  });
}

TEST(ParabolicCylinder, DomainAndLimits) {
  tsmtest::ExpectCases({
      {Dv(NAN, 1), NAN},
      {Dv(1, NAN), NAN},
      {Dv(kInf, 1), NAN},
      {Dv(2.5, kInf), 0},
      {Dv(3, -kInf), 0},      // nonnegative integer order: e^(-x^2/4) He_n(x)
      {Dv(-0.5, -kInf), kInf},  // the sign of 1/Gamma(-v)
      {Dv(0.5, -kInf), -kInf},
      {Dv(2, 0), -1},  // He_2(0)
      {Dv(3, 0), 0},
      {Dv(-0.5, -60), kInf},  // overflow
      {Dv(30, 1e3), 0},       // underflow
      {Dv(2.5, 1e3), 0},
  });
}

}  // namespace
