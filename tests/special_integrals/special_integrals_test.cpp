// The integral, elliptic and dilogarithm entries against mpmath values made by
// tools/golden/special_integrals_golden.py (tests/data/special_integrals_*.txt),
// and the defined values at the edges of their domains.
//
// Tolerances, in eps = 2.220446049250313e-16, are a few times the error bound
// of each method: one Chebyshev or rational evaluation and a handful of
// roundings around it (8 eps); Ci and Chi are measured against their envelope
// near their zeros, where the result is a difference of values of order 1;
// E_n's continued fraction and series and the Landen sweeps accumulate a few
// more roundings (16 eps); sn, cn, dn absolutely, since their phase carries an
// error proportional to the amplitude (32 eps).
#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <numbers>
#include <string>
#include <vector>

#include "tsmath/tsmath.h"
#include "support/golden_rows.h"

namespace {

constexpr double kEps = 2.220446049250313e-16;
constexpr double kInf = INFINITY;
constexpr double kPi = std::numbers::pi;

using Row = tsmtest::GoldenRow;

std::vector<Row> Load(const std::string& name) { return tsmtest::LoadGoldenRows("special_integrals_" + name + ".txt"); }

double Rel(double got, double want, double scale = 0) {
  const double s = std::fmax(std::fabs(want), scale);
  return s == 0 ? std::fabs(got) : std::fabs(got - want) / s;
}

double Call1(void (*f)(double, double*), double x) {
  double r = 0;
  f(x, &r);
  return r;
}

// One golden file: `check` returns the error of one row; all must stay within tol.
struct GoldenCase {
  const char* file;
  double tol;
  std::function<double(const Row&)> check;
};

class Golden : public ::testing::TestWithParam<GoldenCase> {};

TEST_P(Golden, MatchesMpmath) {
  const GoldenCase& c = GetParam();
  const std::vector<Row> rows = Load(c.file);
  const double worst = tsmtest::WorstGoldenError(c.file, rows, c.tol, c.check);
  std::printf("%-12s %zu cases, max error %.2e (%.1f eps)\n", c.file, rows.size(), worst, worst / kEps);
}

double FresnelError(const Row& r) {
  double s, c;
  TS_FresnelIntegrals(r[0], &s, &c);
  return std::fmax(Rel(s, r[1]), Rel(c, r[2]));
}

double ExpIError(const Row& r) {
  double e;
  TS_ExpI(r[1], static_cast<int32_t>(r[0]), &e);  // value first, order second
  return Rel(e, r[2]);
}

double SiCiError(const Row& r) {
  const double x = r[0];
  return std::fmax(Rel(Call1(TS_SinI, x), r[1]), Rel(Call1(TS_CosI, x), r[2], std::fmin(1.0, 1 / x)));
}

double ShiChiError(const Row& r) {
  const double x = r[0];
  return std::fmax(Rel(Call1(TS_SinhI, x), r[1]), Rel(Call1(TS_CoshI, x), r[2], x < 1 ? 1.0 : 0.0));
}

double CompleteError(const Row& r) {
  double k, e;
  TS_Elliptic1(r[0], NAN, &k);
  TS_Elliptic2(r[0], NAN, &e);
  return std::fmax(Rel(k, r[1]), Rel(e, r[2]));
}

double IncompleteError(const Row& r) {
  double f, e;
  TS_Elliptic1(r[1], r[0], &f);
  TS_Elliptic2(r[1], r[0], &e);
  return std::fmax(Rel(f, r[2]), Rel(e, r[3]));
}

// Absolute error of sn, cn, dn. The near-1 form in use from m = 0.999999999
// is first order in 1 - m, with an error of about ((1 - m)/4)^2 e^(2|u|)/4:
// those cases are held to that bound instead.
double JacobiError(const Row& r) {
  const double u = r[0], m = r[1];
  double sn, cn, dn;
  TS_EllipticJ(u, m, &sn, &cn, &dn, nullptr);
  double e = std::fmax(std::fabs(sn - r[2]), std::fmax(std::fabs(cn - r[3]), std::fabs(dn - r[4])));
  if (m >= 0.999999999) {
    const double q = (1 - m) / 4;
    e = std::fmax(0.0, e - q * q * std::exp(2 * std::fabs(u)));
  }
  return e;
}

double DilogError(const Row& r) { return Rel(Call1(TS_Diln, r[0]), r[1]); }

INSTANTIATE_TEST_SUITE_P(
    Kernels, Golden,
    ::testing::Values(GoldenCase{"fresnel", 8 * kEps, FresnelError}, GoldenCase{"expint", 16 * kEps, ExpIError},
                      GoldenCase{"sici", 16 * kEps, SiCiError}, GoldenCase{"shichi", 8 * kEps, ShiChiError},
                      GoldenCase{"complete", 4 * kEps, CompleteError},
                      GoldenCase{"incomplete", 16 * kEps, IncompleteError},
                      GoldenCase{"jacobi", 32 * kEps, JacobiError}, GoldenCase{"dilog", 8 * kEps, DilogError}),
    [](const auto& info) { return std::string(info.param.file); });

using tsmtest::ExpectCases;

double ExpI(double x, int32_t n) {
  double r;
  TS_ExpI(x, n, &r);
  return r;
}

TEST(Domains, ExponentialIntegral) {
  ExpectCases({{ExpI(709.8, 1), 0}, {ExpI(kInf, 3), 0}, {ExpI(0, 0), kInf}, {ExpI(0, 1), kInf},
               {ExpI(0, 2), 1}, {ExpI(0, 5), 0.25}, {ExpI(1, -1), NAN}, {ExpI(-1, 2), NAN}, {ExpI(NAN, 2), NAN}});
}

TEST(Domains, SineCosineIntegrals) {
  ExpectCases({{Call1(TS_SinI, 0), 0}, {Call1(TS_CosI, 0), -kInf}, {Call1(TS_SinI, kInf), kPi / 2},
               {Call1(TS_SinI, -kInf), -kPi / 2}, {Call1(TS_CosI, kInf), 0}, {Call1(TS_SinI, -5.5), -Call1(TS_SinI, 5.5)},
               {Call1(TS_CosI, -5.5), Call1(TS_CosI, 5.5)}, {Call1(TS_SinI, NAN), NAN}, {Call1(TS_CosI, NAN), NAN}});
}

TEST(Domains, HyperbolicIntegrals) {
  // Finite up to their own overflow near 716, +inf from there and above 880.
  EXPECT_TRUE(std::isfinite(Call1(TS_SinhI, 715)));
  EXPECT_TRUE(std::isfinite(Call1(TS_CoshI, 715)));
  ExpectCases({{Call1(TS_SinhI, 0), 0}, {Call1(TS_CoshI, 0), -kInf}, {Call1(TS_SinhI, 718), kInf},
               {Call1(TS_SinhI, -718), -kInf}, {Call1(TS_CoshI, 881), kInf}, {Call1(TS_SinhI, kInf), kInf},
               {Call1(TS_SinhI, -3.5), -Call1(TS_SinhI, 3.5)}, {Call1(TS_CoshI, -3.5), Call1(TS_CoshI, 3.5)},
               {Call1(TS_SinhI, NAN), NAN}, {Call1(TS_CoshI, NAN), NAN}});
}

TEST(Domains, Fresnel) {
  auto s = [](double x) { double a, b; TS_FresnelIntegrals(x, &a, &b); return a; };
  auto c = [](double x) { double a, b; TS_FresnelIntegrals(x, &a, &b); return b; };
  ExpectCases({{s(0), 0}, {c(0), 0}, {s(36974.5), 0.5}, {c(36974.5), 0.5}, {s(-4e4), -0.5}, {c(kInf), 0.5},
               {s(-2.3), -s(2.3)}, {c(-2.3), -c(2.3)}, {s(NAN), NAN}, {c(NAN), NAN}});
}

double Ell(void (*f)(double, double, double*), double m, double phi) {
  double r;
  f(m, phi, &r);
  return r;
}

double Ell85(void (*f)(double, double, double*, int32_t), double m, double phi, int32_t mode) {
  double r;
  f(m, phi, &r, mode);
  return r;
}

TEST(Domains, CompleteElliptic) {
  // Below q = 1 - m = 7e-06, K is the two-term form ln 4 - ln(q)/2.
  const double m = 1 - 1e-7, q = 1 - m;
  ExpectCases({{Ell(TS_Elliptic1, 1, NAN), kInf}, {Ell(TS_Elliptic1, -0.1, NAN), NAN},
               {Ell(TS_Elliptic1, 1.1, NAN), NAN}, {Ell(TS_Elliptic1, m, NAN), 1.3862943611198906 - 0.5 * std::log(q)},
               {Ell(TS_Elliptic2, 1, NAN), 1}, {Ell(TS_Elliptic2, 1.1, NAN), NAN}, {Ell(TS_Elliptic2, NAN, NAN), NAN}});
  EXPECT_NEAR(Ell(TS_Elliptic1, 0, NAN), kPi / 2, 2 * kEps);
  EXPECT_NEAR(Ell(TS_Elliptic2, 0, NAN), kPi / 2, 2 * kEps);
}

TEST(Domains, SelectorsAgree) {
  for (double m : {0.0, 0.3, 0.99, 1 - 1e-6, 1.0, 2.0}) {
    for (double phi : {-4.0, 0.0, 0.7, 2.5}) {
      ExpectCases({{Ell85(TS_Elliptic1_85, m, phi, 1), Ell(TS_Elliptic1, m, NAN)},
                   {Ell85(TS_Elliptic2_85, m, phi, 1), Ell(TS_Elliptic2, m, NAN)},
                   {Ell85(TS_Elliptic1_85, m, phi, 0), Ell(TS_Elliptic1, m, phi)},
                   {Ell85(TS_Elliptic2_85, m, phi, 2), Ell(TS_Elliptic2, m, phi)}});
    }
  }
}

TEST(Domains, IncompleteElliptic) {
  ExpectCases({{Ell(TS_Elliptic1, 0, 2.5), 2.5}, {Ell(TS_Elliptic2, 0, -7.0), -7.0}, {Ell(TS_Elliptic1, 1, 2.0), kInf},
               {Ell(TS_Elliptic1, -0.5, 1.0), NAN}, {Ell(TS_Elliptic2, 1.5, 1.0), NAN}, {Ell(TS_Elliptic1, 0.5, kInf), kInf},
               {Ell(TS_Elliptic2, 0.5, -kInf), -kInf}});
  EXPECT_NEAR(Ell(TS_Elliptic1, 1, 0.5), std::asinh(std::tan(0.5)), 4 * kEps);
  EXPECT_NEAR(Ell(TS_Elliptic2, 1, 0.5), std::sin(0.5), 4 * kEps);
  // E(phi, 1) grows by 2 over each period of pi.
  EXPECT_NEAR(Ell(TS_Elliptic2, 1, 0.5 + 2 * kPi), std::sin(0.5) + 4, 16 * kEps);
}

TEST(Domains, Jacobi) {
  double sn, cn, dn, phi = -1;
  TS_EllipticJ(0.8, 0.3, &sn, &cn, &dn, nullptr);  // a null phi is not written
  double sn2, cn2, dn2;
  TS_EllipticJ(0.8, 0.3, &sn2, &cn2, &dn2, &phi);
  EXPECT_EQ(sn, sn2);
  EXPECT_EQ(cn, cn2);
  EXPECT_EQ(dn, dn2);
  EXPECT_NEAR(phi, std::asin(sn), 4 * kEps);
  TS_EllipticJ(0.8, 0, &sn, &cn, &dn, &phi);
  const double u = 0.8;
  EXPECT_NEAR(sn, std::sin(u), kEps);
  EXPECT_NEAR(cn, std::cos(u), kEps);
  ExpectCases({{dn, 1}, {phi, u}});
  TS_EllipticJ(u, 1, &sn, &cn, &dn, &phi);
  EXPECT_NEAR(sn, std::tanh(u), kEps);
  EXPECT_NEAR(cn, 1 / std::cosh(u), kEps);
  EXPECT_NEAR(dn, 1 / std::cosh(u), kEps);
  for (double m : {-0.1, 1.1, double(NAN)}) {
    TS_EllipticJ(0.8, m, &sn, &cn, &dn, &phi);
    ExpectCases({{sn, NAN}, {cn, NAN}, {dn, NAN}, {phi, NAN}});
  }
}

TEST(Domains, Dilogarithm) {
  ExpectCases({{Call1(TS_Diln, 0), 1.6449340668482264}, {Call1(TS_Diln, 1), 0}, {Call1(TS_Diln, -0.5), NAN},
               {Call1(TS_Diln, kInf), -kInf}, {Call1(TS_Diln, NAN), NAN}});
}

}  // namespace
