// The domain rules of the gamma-family entries: NaN, infinities, poles,
// negative arguments, overflow, and the agreement of the revised entries.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "support/host_arrays.h"

namespace {

constexpr double kInf = std::numeric_limits<double>::infinity();
const double kNaN = std::numeric_limits<double>::quiet_NaN();

double One(void (*f)(double, double*), double x) {
  double r = 12345.0;
  f(x, &r);
  return r;
}
double Gamma(double a, double x) {
  double r = 12345.0;
  TS_Gamma(a, x, &r);
  return r;
}
double GammaC(double a, double x) {
  double r = 12345.0;
  TS_GammaC(a, x, &r);
  return r;
}
double Beta(double a, double b, double x) {
  double r = 12345.0;
  TS_Beta(a, b, x, &r);
  return r;
}
double Fact(int32_t n) {
  double r = 12345.0;
  TS_Fact(n, &r);
  return r;
}
double LnFact(int32_t n) {
  double r = 12345.0;
  TS_LnFact(n, &r);
  return r;
}

// Same value or both NaN.
bool Same(double a, double b) { return (std::isnan(a) && std::isnan(b)) || a == b; }

struct Expect {
  const char* what;
  double got, want;  // want NaN: any NaN
};

TEST(SpecialGammaDomain, LimitsPolesAndBadArguments) {
  const Expect cases[] = {
      {"Gamma(+inf)", Gamma(kInf, kNaN), kInf},
      {"Gamma(-inf)", Gamma(-kInf, kNaN), kNaN},
      {"Gamma(NaN)", Gamma(kNaN, kNaN), kNaN},
      {"Gamma(0)", Gamma(0, kNaN), kNaN},
      {"Gamma(-3)", Gamma(-3, kNaN), kNaN},
      {"Gamma(-40)", Gamma(-40, kNaN), kNaN},
      {"Gamma(-1.5)", Gamma(-1.5, kNaN), 2.3632718012073548},  // 4 sqrt(pi)/3
      {"Gamma(172)", Gamma(172, kNaN), kInf},
      {"Gamma(-190.5)", Gamma(-190.5, kNaN), 0.0},  // underflows through the reflection
      {"LnGamma(-1.5)", One(TS_LnGamma, -1.5), kNaN},  // no reflection in the log form
      {"LnGamma(0)", One(TS_LnGamma, 0), kInf},
      {"LnGamma(+inf)", One(TS_LnGamma, kInf), kInf},
      {"LnGamma(-inf)", One(TS_LnGamma, -kInf), kNaN},
      {"Stirling(709.79)", One(TS_Stirling, 709.79), kInf},
      {"Stirling(0)", One(TS_Stirling, 0), kNaN},
      {"Stirling(-2)", One(TS_Stirling, -2), kNaN},
      {"Stirling(+inf)", One(TS_Stirling, kInf), kInf},
      {"Psi(0)", One(TS_Psi, 0), kInf},
      {"Psi(-2)", One(TS_Psi, -2), kInf},
      {"Psi(+inf)", One(TS_Psi, kInf), kInf},
      {"Psi(NaN)", One(TS_Psi, kNaN), kNaN},
      {"Fact(-1)", Fact(-1), kNaN},
      {"Fact(171)", Fact(171), kInf},
      {"LnFact(-1)", LnFact(-1), kNaN},
      {"LnFact(0)", LnFact(0), 0.0},
      {"LnFact(1)", LnFact(1), 0.0},
      {"P(a, +inf)", Gamma(2, kInf), 1.0},
      {"P(a, -inf)", Gamma(2, -kInf), kNaN},
      {"P(a, 0)", Gamma(2, 0), 0.0},
      {"P(a, -1)", Gamma(2, -1), kNaN},
      {"P(0, x)", Gamma(0, 1), kNaN},
      {"P(-inf, x)", Gamma(-kInf, 1), kNaN},
      {"P(+inf, x)", Gamma(kInf, 1), kInf},
      {"Q(a, +inf)", GammaC(2, kInf), 0.0},
      {"Q(a, 0)", GammaC(2, 0), 1.0},
      {"Q(a, -1)", GammaC(2, -1), kNaN},
      {"Q(a, NaN)", GammaC(2, kNaN), kNaN},
      {"Q(-1, x)", GammaC(-1, 2), kNaN},
      {"I(a, b, 0)", Beta(2, 3, 0), 0.0},
      {"I(a, b, 1)", Beta(2, 3, 1), 1.0},
      {"I(1, 1, x)", Beta(1, 1, 0.3), 0.3},
      {"I(a, b, 1.5)", Beta(2, 3, 1.5), kNaN},
      {"I(a, b, -0.5)", Beta(2, 3, -0.5), kNaN},
      {"I(0, b, x)", Beta(0, 3, 0.5), kNaN},
      {"I(a, inf, x)", Beta(2, kInf, 0.5), kNaN},
      {"B(NaN, b)", Beta(kNaN, 3, kNaN), kNaN},
      {"B(inf, b)", Beta(kInf, 3, kNaN), kNaN},
      {"Erf(+inf)", One(TS_Erf, kInf), 1.0},
      {"Erf(-inf)", One(TS_Erf, -kInf), -1.0},
      {"Erf(NaN)", One(TS_Erf, kNaN), kNaN},
      {"ErfC(+inf)", One(TS_ErfC, kInf), 0.0},
      {"ErfC(-inf)", One(TS_ErfC, -kInf), 2.0},
      {"ErfC(30)", One(TS_ErfC, 30), 0.0},
      {"ErfC(-30)", One(TS_ErfC, -30), 2.0},
      {"Dawson(+inf)", One(TS_Dawson, kInf), 0.0},
      {"Dawson(NaN)", One(TS_Dawson, kNaN), kNaN},
      {"Zeta(+inf)", One(TS_Zeta, kInf), kInf},
      {"Zeta(127)", One(TS_Zeta, 127), 1.0},
      {"Zeta(1)", One(TS_Zeta, 1), kInf},
      {"Zeta(0)", One(TS_Zeta, 0), -0.5},
      {"Zeta(-31)", One(TS_Zeta, -31), kInf},  // declared an overflow
      {"Zeta(NaN)", One(TS_Zeta, kNaN), kNaN},
  };
  for (const auto& c : cases) EXPECT_TRUE(Same(c.got, c.want)) << c.what << ": got " << c.got << ", want " << c.want;
}

TEST(SpecialGammaDomain, FactorialSwitchesFromTableToProductToGamma) {
  EXPECT_EQ(Fact(33), 8.683317618811886e36);
  // 34! = 295232799039604140847618609643520000000, 170! from mpmath.
  EXPECT_NEAR(Fact(34) / 2.9523279903960414084761860964352e38, 1.0, 4 * tsmtest::kEps);
  EXPECT_NEAR(Fact(50) / 3.0414093201713378043612608166065e64, 1.0, 20 * tsmtest::kEps);
  EXPECT_NEAR(Fact(170) / 7.2574156153079989673967282111292e306, 1.0, 1e-14);
}

TEST(SpecialGammaDomain, RevisedEntriesAgreeWithTheirNaNSelectedTwins) {
  const double as[] = {-40.5, -2.5, -1.0, 0.0, 1e-12, 0.5, 3.0, 33.0, 33.5, 100.25, 171.7, kInf, -kInf, kNaN};
  for (double a : as) {
    double x1 = 1, x2 = 2;
    TS_Gamma(a, kNaN, &x1);
    TS_Gamma_85(a, 0.75, &x2, 1);
    EXPECT_TRUE(Same(x1, x2)) << "a = " << a;
    TS_Gamma(a, 0.75, &x1);
    TS_Gamma_85(a, 0.75, &x2, 0);
    EXPECT_TRUE(Same(x1, x2)) << "a = " << a;
    for (double b : {0.5, -0.5, 7.0}) {
      TS_Beta(a, b, kNaN, &x1);
      TS_Beta_85(a, b, 0.3, &x2, 1);
      EXPECT_TRUE(Same(x1, x2)) << "a = " << a << ", b = " << b;
      TS_Beta(a, b, 0.3, &x1);
      TS_Beta_85(a, b, 0.3, &x2, 2);
      EXPECT_TRUE(Same(x1, x2)) << "a = " << a << ", b = " << b;
    }
  }
}

TEST(SpecialGammaDomain, StirlingApproachesGamma) {
  // Stirling's formula with its five-term correction is good to about 1e-8 at x = 4.
  EXPECT_NEAR(One(TS_Stirling, 4.0) / 6.0, 1.0, 1e-7);
}

}  // namespace
