// The window entries against tools/golden/windows_golden.py
// (tests/data/windows_golden.txt): scipy where it has the window, direct
// mpmath evaluation otherwise, the Dolph-Chebyshev window as a direct DFT of
// its Chebyshev samples. Every case runs once on the C heap and once with the
// analysis workspace enabled, real and complex.
//
// Tolerances (absolute; every window here peaks at 1), eps = 2.22e-16:
//   cosine sums   eps (n/4 + 8) sum|a|: the rotation adds about an ulp of
//                 each coefficient per step, partly cancelling, over the
//                 n/2 steps to the middle.
//   formulas      16 eps: a handful of operations and one cos or sin.
//   Kaiser        64 eps: ratios of series of up to 25 positive terms.
//   Gaussian      eps (|arg| + 8): exp of an argument good to 2 ulps.
//   exponential   eps (i + 4) (|ln final| + 1) relative: the exponent is a
//                 running sum of i steps.
//   Dolph-Cheb.   16 eps log2 N: an inverse real FFT; the Chebyshev samples
//                 are formed from v - 1 without cancellation, so they add
//                 only a few ulps.
//   taper         8 eps.  constants: 4 n eps relative (plain sums of n terms).
#include <gtest/gtest.h>

#include <cmath>
#include <fstream>
#include <functional>
#include <map>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"
#include "support/random_data.h"
#include "windows/window_coefficients.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;

struct Case {
  std::string kind;  // per, sym, exp, taper, const
  int sel = 0;
  double param = 0;
  V w;                  // window, or {enbw, cg}
  int n = 0;
};

std::vector<Case> Load() {
  std::ifstream in(std::string(TSM_TEST_DATA) + "/windows_golden.txt");
  EXPECT_TRUE(in.good()) << "tests/data/windows_golden.txt missing";
  std::vector<Case> cases;
  std::string line;
  const auto num = [](std::istream& s) {
    std::string t;
    s >> t;
    return std::strtod(t.c_str(), nullptr);
  };
  while (std::getline(in, line)) {
    if (line.empty() || line[0] == '#') continue;
    std::istringstream s(line);
    Case c;
    s >> c.kind;
    if (c.kind == "per" || c.kind == "sym" || c.kind == "const") {
      s >> c.sel;
    }
    c.param = num(s);
    s >> c.n;
    const int values = c.kind == "const" ? 2 : c.n;
    for (int i = 0; i < values; ++i) c.w.push_back(num(s));
    cases.push_back(c);
  }
  return cases;
}

const std::vector<Case>& Golden() {
  static const std::vector<Case> cases = Load();
  return cases;
}

double Tolerance(const Case& c, int i) {
  const int n = c.n;
  if (c.kind == "exp") return kEps * (i + 4) * (std::fabs(std::log(c.param)) + 1) * std::fabs(c.w[i]);
  if (c.kind == "taper") return 8 * kEps;
  if (kCosineCoefficients.count(c.sel)) {
    double s = 0;
    for (double a : kCosineCoefficients.at(c.sel)) s += std::fabs(a);
    return kEps * (n / 4 + 8) * s;
  }
  switch (c.sel) {
    case 60: return 64 * kEps;
    case 61: return 16 * kEps * std::log2(n + 1.0);
    case 62: return kEps * (std::fabs(std::log(std::fmax(c.w[i], 1e-300))) + 8);
    default: return 16 * kEps;
  }
}

// The periodic entry of a selector, applied to the handle, real or complex.
template <class H>
int32_t ApplyPeriodic(H h, int sel, double p) {
  constexpr bool kCx = std::is_same_v<H, CxArrayHdl>;
  if (kCosineCoefficients.count(sel)) {
    if constexpr (kCx) return CxAllCosWinH(h, sel, 0);
    else return AllCosWinH(h, sel, 0);
  }
  switch (sel) {
    case 30: if constexpr (kCx) return CxTriangleWinH(h); else return TriangleWinH(h);
    case 31: if constexpr (kCx) return CxBartHannWinH(h); else return BartHannWinH(h);
    case 32: if constexpr (kCx) return CxBohmanWinH(h); else return BohmanWinH(h);
    case 33: if constexpr (kCx) return CxParzenWinH(h); else return ParzenWinH(h);
    case 34: if constexpr (kCx) return CxWelchWinH(h); else return WelchWinH(h);
    case 60: if constexpr (kCx) return CxKaiserH(h, p); else return KaiserH(h, p);
    case 61: if constexpr (kCx) return CxDolChebyWinH(h, p, 0); else return DolChebyWinH(h, p, 0);
    case 62: if constexpr (kCx) return CxGaussWinH(h, p, 0); else return GaussWinH(h, p, 0);
  }
  return 1;
}

template <class H>
int32_t ApplyCase(H h, const Case& c) {
  constexpr bool kCx = std::is_same_v<H, CxArrayHdl>;
  if (c.kind == "per") return ApplyPeriodic(h, c.sel, c.param);
  if (c.kind == "exp") {
    if constexpr (kCx) return CxExpWinH(h, c.param); else return ExpWinH(h, c.param);
  }
  if (c.kind == "taper") {
    if constexpr (kCx) return CxCosTaperedH(h, c.param); else return CosTaperedH(h, c.param);
  }
  if constexpr (kCx) return CxSymmWinH(h, c.sel, c.param); else return SymmWinH(h, c.sel, c.param);
}

// Form A entries and the symmetric forms of the parametric entries.
std::function<int32_t(F64ArrayHdl)> OtherEntry(const Case& c) {
  const auto a = [](std::function<int32_t(F64ArrayHdl, int32_t*)> f) {
    return [f](F64ArrayHdl x) {
      int32_t err = 1;
      return f(x, &err) + err;
    };
  };
  double p = c.param;
  if (c.kind == "per" && c.sel == 30) return a(TriangleWin);
  if (c.kind == "per" && c.sel == 60) return a([p](F64ArrayHdl x, int32_t* e) mutable { return Kaiser_Bessel(x, &p, e); });
  if (c.kind == "exp") return a([p](F64ArrayHdl x, int32_t* e) mutable { return ExpWindCIN(x, &p, e); });
  if (c.kind == "taper" && c.param == 0.2) return a(CosTapered);
  if (c.kind == "sym" && c.sel == 61) return [p](F64ArrayHdl x) { return DolChebyWinH(x, p, 1); };
  if (c.kind == "sym" && c.sel == 62) return [p](F64ArrayHdl x) { return GaussWinH(x, p, -3); };
  return {};
}

std::string Name(const Case& c) {
  std::ostringstream s;
  s << c.kind << " sel " << c.sel << " param " << c.param << " n " << c.n;
  return s.str();
}

void CheckWindows() {
  int checked = 0;
  for (const Case& c : Golden()) {
    if (c.kind == "const") continue;
    F64 ones(V(c.n, 1.0));
    ASSERT_EQ(ApplyCase(ones.Handle(), c), 0) << Name(c);
    const V w = ones.Values();
    ASSERT_EQ(static_cast<int>(w.size()), c.n);
    for (int i = 0; i < c.n; ++i) ASSERT_NEAR(w[i], c.w[i], Tolerance(c, i)) << Name(c) << " i " << i;
    // The same window through the other entries that make it.
    if (const auto other = OtherEntry(c)) {
      F64 y(V(c.n, 1.0));
      ASSERT_EQ(other(y.Handle()), 0) << Name(c);
      for (int i = 0; i < c.n; ++i) ASSERT_NEAR(y.At(i), c.w[i], Tolerance(c, i)) << Name(c) << " other, i " << i;
    }

    // The complex twin scales both parts by exactly the real window.
    const std::vector<cx> z = RandomCx(c.n, c.n);
    V re, im;
    for (const cx& v : z) re.push_back(v.re), im.push_back(v.im);
    Cx zc(z);
    F64 zr(re), zi(im);
    ASSERT_EQ(ApplyCase(zc.Handle(), c), 0);
    ASSERT_EQ(ApplyCase(zr.Handle(), c), 0);
    ASSERT_EQ(ApplyCase(zi.Handle(), c), 0);
    for (int i = 0; i < c.n; ++i) {
      ASSERT_EQ(zc.At(i).re, zr.At(i)) << Name(c) << " i " << i;
      ASSERT_EQ(zc.At(i).im, zi.At(i)) << Name(c) << " i " << i;
    }
    ++checked;
  }
  EXPECT_GT(checked, 250);
}

// The periodic windows of the formula and parametric selectors, measured.
void CheckMeasuredConstants() {
  for (const Case& c : Golden()) {
    if (c.kind != "const") continue;
    const double tol = 4 * c.n * kEps;
    WinConsts k{-1, -1};
    ASSERT_EQ(WinConstByNameH(c.n, c.sel, c.param, &k), 0) << Name(c);
    EXPECT_NEAR(k.enbw, c.w[0], tol * c.w[0]) << Name(c);
    EXPECT_NEAR(k.cg, c.w[1], tol * c.w[1]) << Name(c);

    // ScaledWinH reports the same figures and divides the window by cg.
    F64 ones(V(c.n, 1.0));
    WinConsts s{-1, -1};
    ASSERT_EQ(ScaledWinH(ones.Handle(), c.sel, c.param, &s), 0) << Name(c);
    EXPECT_NEAR(s.enbw, c.w[0], tol * c.w[0]) << Name(c);
    EXPECT_NEAR(s.cg, c.w[1], tol * c.w[1]) << Name(c);
    double mean = 0;
    for (double v : ones.Values()) mean += v;
    EXPECT_NEAR(mean / c.n, 1.0, tol) << Name(c);
  }
}

// Cosine sums scaled to unit gain: the window divided by a[0].
void CheckScaledCosineSums() {
  for (const Case& c : Golden()) {
    if (c.kind != "per" || !kCosineCoefficients.count(c.sel)) continue;
    const double a0 = kCosineCoefficients.at(c.sel)[0];
    F64 x(V(c.n, 1.0)), g(V(c.n, 1.0));
    WinConsts k{-1, -1};
    ASSERT_EQ(ScaledWinH(x.Handle(), c.sel, 0.0, &k), 0);
    F64 a(kCosineCoefficients.at(c.sel));
    ASSERT_EQ(ScaledGenCosWinH(g.Handle(), a.Handle()), 0);
    for (int i = 0; i < c.n; ++i) {
      ASSERT_NEAR(x.At(i), c.w[i] / a0, Tolerance(c, i) / a0) << Name(c) << " i " << i;
      ASSERT_NEAR(g.At(i), c.w[i] / a0, Tolerance(c, i) / a0) << Name(c) << " i " << i;
    }
    F64 plain(V(c.n, 1.0));
    ASSERT_EQ(GenCosWinH(plain.Handle(), a.Handle()), 0);
    for (int i = 0; i < c.n; ++i) ASSERT_NEAR(plain.At(i), c.w[i], Tolerance(c, i)) << Name(c) << " i " << i;
  }
}

class WindowsGolden : public ::testing::TestWithParam<bool> {
 protected:
  void SetUp() override {
    if (GetParam()) arena_.emplace(1 << 20);
  }
  void TearDown() override { arena_.reset(); }
  std::optional<ScopedWorkspace> arena_;
};

TEST_P(WindowsGolden, WindowsMatchReferences) { CheckWindows(); }
TEST_P(WindowsGolden, MeasuredConstants) { CheckMeasuredConstants(); }
TEST_P(WindowsGolden, ScaledCosineSums) { CheckScaledCosineSums(); }

INSTANTIATE_TEST_SUITE_P(HeapAndArena, WindowsGolden, ::testing::Values(false, true),
                         [](const auto& info) { return info.param ? "Arena" : "Heap"; });

}  // namespace
}  // namespace tsmtest
