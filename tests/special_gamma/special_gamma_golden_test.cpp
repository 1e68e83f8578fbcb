// The gamma-family entries against mpmath values at 40 digits, made by
// tools/golden/special_gamma_golden.py (tests/data/special_gamma_*.txt).
//
// The error of a point is |ours - reference| / scale, scale being |reference|
// or, near a zero of the function, its envelope (see the script). The bar is
// 1e-14 everywhere for the complete functions (one exception noted below). The incomplete gamma and beta
// functions go through exp(ln prefactor), whose exponent is a sum of terms of
// size `cond` (a column of the data), each good to an eps or two: they must
// meet 1e-14 where cond <= 20 and 8 eps cond beyond. BetaFn, formed the same
// way from three log-gamma values, is held to the same rule. Q(a, x) below
// x = 1 or a is 1 - P(a, x): its cond grows by P/Q.
//
// Each kernel's point count, maximum and median error are printed as
//   [accuracy] <kernel> <points> <max> <median>
// which tools/special/accuracy.py collects for docs/accuracy.md.
#include <gtest/gtest.h>

#include <algorithm>
#include <cfloat>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <functional>
#include <limits>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"

namespace {

using tsmtest::kEps;

constexpr double kBar = 1e-14;
constexpr double kWellConditioned = 20;
// Near x = 1 with one small parameter the incomplete beta fractions need more
// than their 100 rounds, and stop short by up to about 1e-10.
constexpr double kFractionLimited = 1e-9;

struct Point {
  std::vector<double> args;
  std::vector<long double> cols;  // value, scale or cond columns as in the file
};

std::vector<Point> Load(const std::string& name, int nargs) {
  std::ifstream in(std::string(TSM_TEST_DATA) + "/special_gamma_" + name + ".txt");
  std::vector<Point> pts;
  std::string line, tok;
  while (std::getline(in, line)) {
    if (line.empty() || line[0] == '#') continue;
    std::istringstream ls(line);
    Point p;
    for (int i = 0; ls >> tok; ++i) {
      if (i < nargs) {
        p.args.push_back(std::strtod(tok.c_str(), nullptr));
      } else {
        p.cols.push_back(std::strtold(tok.c_str(), nullptr));
      }
    }
    pts.push_back(p);
  }
  return pts;
}

struct Kernel {
  const char* name;
  const char* file;
  int nargs;
  int value, scale, cond;  // columns; scale -1: |value|, cond -1: none
  std::function<double(const std::vector<double>&)> eval;
  double loose = 0;  // bar beyond the well-conditioned set; 0: 8 eps cond
  int complement = -1;  // column of 1 - value, where the kernel may form value as 1 - it
};

double Call1(void (*f)(double, double*), double x) {
  double r = 12345.0;
  f(x, &r);
  return r;
}

const double kNaN = std::numeric_limits<double>::quiet_NaN();

const Kernel kKernels[] = {
    {"Factorial", "factorial", 1, 0, 1, -1, [](auto& a) { double r; TS_Fact(int32_t(a[0]), &r); return r; }},
    {"LogFactorial", "lnfactorial", 1, 0, 1, -1, [](auto& a) { double r; TS_LnFact(int32_t(a[0]), &r); return r; }},
    {"GammaFn", "gamma", 1, 0, 1, -1, [](auto& a) { double r; TS_Gamma(a[0], kNaN, &r); return r; }},
    {"LogGamma", "loggamma", 1, 0, 1, -1, [](auto& a) { return Call1(TS_LnGamma, a[0]); }},
    {"Digamma", "digamma", 1, 0, 1, -1, [](auto& a) { return Call1(TS_Psi, a[0]); }},
    {"ErrorFn", "erf", 1, 0, 1, -1, [](auto& a) { return Call1(TS_Erf, a[0]); }},
    {"ErrorFnC", "erfc", 1, 0, 1, -1, [](auto& a) { return Call1(TS_ErfC, a[0]); }},
    {"DawsonIntegral", "dawson", 1, 0, 1, -1, [](auto& a) { return Call1(TS_Dawson, a[0]); }},
    {"RiemannZeta", "zeta", 1, 0, 1, -1, [](auto& a) { return Call1(TS_Zeta, a[0]); }},
    {"BetaFn", "beta", 2, 0, 1, 2, [](auto& a) { double r; TS_Beta(a[0], a[1], kNaN, &r); return r; }},
    {"IncompleteGamma", "incgamma", 2, 0, -1, 2, [](auto& a) { double r; TS_Gamma(a[0], a[1], &r); return r; }},
    {"IncompleteGammaC", "incgamma", 2, 1, -1, 2, [](auto& a) { double r; TS_GammaC(a[0], a[1], &r); return r; }, 0,
     0},
    {"IncompleteBeta", "incbeta", 3, 0, -1, 1, [](auto& a) { double r; TS_Beta(a[0], a[1], a[2], &r); return r; },
     kFractionLimited},
};

class Golden : public ::testing::TestWithParam<Kernel> {};

TEST_P(Golden, MeetsTheBar) {
  const Kernel& k = GetParam();
  const std::vector<Point> pts = Load(k.file, k.nargs);
  ASSERT_GT(pts.size(), 150u) << k.file;
  std::vector<double> errs;
  int failures = 0;
  for (const auto& p : pts) {
    const double got = k.eval(p.args);
    const long double want = p.cols[k.value];
    if (std::fabs(want) > DBL_MAX) {
      EXPECT_EQ(got, std::numeric_limits<double>::infinity()) << k.name << " at " << p.args[0];
      continue;
    }
    const long double scale = k.scale >= 0 ? p.cols[k.scale] : std::fabs(want);
    const double err = static_cast<double>(std::fabs(got - want) / (scale > 0 ? scale : 1.0L));
    double cond = k.cond >= 0 ? static_cast<double>(p.cols[k.cond]) : 1.0;
    if (k.complement >= 0) cond *= std::max(1.0L, p.cols[k.complement] / want);
    const bool well = cond <= kWellConditioned;
    if (well) errs.push_back(err);
    const double tol = well ? kBar : k.loose > 0 ? k.loose : std::max(kBar, 8 * kEps * cond);
    if (!(err <= tol) && ++failures <= 5) {
      ADD_FAILURE() << k.name << std::hexfloat << " at (" << p.args[0] << (k.nargs > 1 ? ", " : "")
                    << (k.nargs > 1 ? p.args[1] : 0.0) << (k.nargs > 2 ? ", " : "") << (k.nargs > 2 ? p.args[2] : 0.0)
                    << std::defaultfloat << "): got " << got << ", want " << static_cast<double>(want)
                    << ", error " << err << " > " << tol;
    }
  }
  EXPECT_EQ(failures, 0) << k.name;
  std::sort(errs.begin(), errs.end());
  std::printf("[accuracy] %s %zu %.3g %.3g\n", k.name, errs.size(), errs.empty() ? 0.0 : errs.back(),
              errs.empty() ? 0.0 : errs[errs.size() / 2]);
}

INSTANTIATE_TEST_SUITE_P(SpecialGamma, Golden, ::testing::ValuesIn(kKernels),
                         [](const auto& info) { return std::string(info.param.name); });

}  // namespace
