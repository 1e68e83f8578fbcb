// The window entries' frame and rules: empty arrays, failing kernels and
// their emptied arrays, the 1-sample rule, the documented edge rules of the
// tapers and selectors, the constants table against closed forms, measured
// constants against long double sums, arena exhaustion and refused resizes.
#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <random>
#include <string>
#include <vector>

#include "support/host_arrays.h"
#include "windows/window_coefficients.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using RealCall = std::function<int32_t(F64ArrayHdl)>;

struct Named {
  std::string name;
  RealCall call;
};

// Every real array entry in form B with typical arguments; form A entries
// report through err (returned as the code here).
std::vector<Named> RealEntries() {
  static F64 coefs{0.5, 0.5};
  const auto a = [](std::function<int32_t(F64ArrayHdl, int32_t*)> f) {
    return [f](F64ArrayHdl x) {
      int32_t err = 0x5A5A;
      EXPECT_EQ(f(x, &err), 0);
      return err;
    };
  };
  static WinConsts k;
  return {
      {"AllCosWinH", [](F64ArrayHdl x) { return AllCosWinH(x, 7, 1); }},
      {"GenCosWinH", [](F64ArrayHdl x) { return GenCosWinH(x, coefs.Handle()); }},
      {"ScaledGenCosWinH", [](F64ArrayHdl x) { return ScaledGenCosWinH(x, coefs.Handle()); }},
      {"BartHannWinH", BartHannWinH},
      {"BohmanWinH", BohmanWinH},
      {"ParzenWinH", ParzenWinH},
      {"WelchWinH", WelchWinH},
      {"TriangleWinH", TriangleWinH},
      {"TriangleWin", a(TriangleWin)},
      {"CosTaperedH", [](F64ArrayHdl x) { return CosTaperedH(x, 0.5); }},
      {"CosTapered", a(CosTapered)},
      {"DolChebyWinH", [](F64ArrayHdl x) { return DolChebyWinH(x, 1e4, 0); }},
      {"GaussWinH", [](F64ArrayHdl x) { return GaussWinH(x, 0.3, 0); }},
      {"KaiserH", [](F64ArrayHdl x) { return KaiserH(x, 5.0); }},
      {"Kaiser_Bessel", a([](F64ArrayHdl x, int32_t* e) { double b = 5; return Kaiser_Bessel(x, &b, e); })},
      {"SymmWinH", [](F64ArrayHdl x) { return SymmWinH(x, 33, 0.0); }},
      {"ScaledWinH", [](F64ArrayHdl x) { return ScaledWinH(x, 34, 0.0, &k); }},
      {"ExpWinH", [](F64ArrayHdl x) { return ExpWinH(x, 0.1); }},
      {"ExpWindCIN", a([](F64ArrayHdl x, int32_t* e) { double f = 0.1; return ExpWindCIN(x, &f, e); })},
      {"ForceWinH", [](F64ArrayHdl x) { return ForceWinH(x, 50.0); }},
      {"ForceWindCIN", a([](F64ArrayHdl x, int32_t* e) { double d = 50; return ForceWindCIN(x, &d, e); })},
  };
}

class WindowEntries : public ::testing::Test {
 protected:
  void SetUp() override {
    RealEntries();  // its static arguments are made before the count
    blocks_ = tsrt_live_blocks();
  }
  void TearDown() override { EXPECT_EQ(tsrt_live_blocks(), blocks_); }
  int64_t blocks_ = 0;
};

// Empty arrays are refused and left as they are; one sample is left alone,
// except by the exponential and force windows, which need two; a success
// makes no resize.
TEST_F(WindowEntries, EmptyAndSingleSampleArrays) {
  for (const Named& e : RealEntries()) {
    F64 x;
    const int64_t resizes = tsrt_resize_calls();
    EXPECT_EQ(e.call(x.Handle()), TSM_ERR_EMPTY) << e.name;  // ScaledWinH: its measured selector
    EXPECT_EQ(x.Count(), 0) << e.name;
    if (e.name != "ScaledWinH") {
      EXPECT_EQ(tsrt_resize_calls(), resizes) << e.name << " resized an empty array";
    }
    F64 one{3.25};
    const int32_t code = e.call(one.Handle());
    const bool refuses = e.name.find("Exp") != std::string::npos || e.name.find("Force") != std::string::npos;
    EXPECT_EQ(code, refuses ? TSM_ERR_COUNT_BELOW_2 : 0) << e.name;
    EXPECT_EQ(one.Values(), refuses ? V{} : V{3.25}) << e.name;
    F64 nine(V(9, 1.0));  // success makes no resize
    EXPECT_EQ(RunFailingEachResize([&] { return e.call(nine.Handle()); }, [](int, int32_t) {}), 0) << e.name;
  }
}

// A failing kernel empties the array; a failing shrink still leaves count 0.
TEST_F(WindowEntries, KernelFailuresEmptyTheArray) {
  WinConsts k{1, 1};
  F64 none;
  struct Case { const char* what; int32_t want; RealCall call; } cases[] = {
      {"AllCos selector 10", TSM_ERR_BAD_SELECTOR, [](F64ArrayHdl x) { return AllCosWinH(x, 10, 0); }},
      {"AllCos selector 30", TSM_ERR_BAD_SELECTOR, [](F64ArrayHdl x) { return AllCosWinH(x, 30, 0); }},
      {"AllCos selector -1", TSM_ERR_BAD_SELECTOR, [](F64ArrayHdl x) { return AllCosWinH(x, -1, 1); }},
      {"GenCos no coefficients", TSM_ERR_EMPTY, [&](F64ArrayHdl x) { return GenCosWinH(x, none.Handle()); }},
      {"Exp final 0", TSM_ERR_EXP_FINAL_VALUE, [](F64ArrayHdl x) { return ExpWinH(x, 0.0); }},
      {"Exp final -1", TSM_ERR_EXP_FINAL_VALUE, [](F64ArrayHdl x) { return ExpWinH(x, -1.0); }},
      {"Symm selector 35", TSM_ERR_BAD_SELECTOR, [](F64ArrayHdl x) { return SymmWinH(x, 35, 0.0); }},
      {"Symm selector 10", TSM_ERR_BAD_SELECTOR, [](F64ArrayHdl x) { return SymmWinH(x, 10, 0.0); }},
      {"Scaled selector 63", TSM_ERR_BAD_SELECTOR, [&](F64ArrayHdl x) { return ScaledWinH(x, 63, 0.0, &k); }},
      {"Scaled selector 29", TSM_ERR_BAD_SELECTOR, [&](F64ArrayHdl x) { return ScaledWinH(x, 29, 0.0, &k); }},
  };
  for (const Case& c : cases) {
    for (bool refuse : {false, true}) {
      F64 x{1, 2, 3, 4};
      k = WinConsts{1, 1};
      const int64_t before = tsrt_resize_calls();
      tsrt_fail_resize_at(refuse ? 1 : 0);
      EXPECT_EQ(c.call(x.Handle()), c.want) << c.what << (refuse ? " with the shrink refused" : "");
      tsrt_fail_resize_at(0);
      EXPECT_EQ(tsrt_resize_calls() - before, 1) << c.what;
      EXPECT_EQ(x.Count(), 0) << c.what;
    }
  }
  EXPECT_TRUE(std::isnan(k.enbw) && std::isnan(k.cg)) << "ScaledWinH leaves NaN after a failure";
  // Form A: the code goes to err and the entry returns 0.
  F64 x{1, 2};
  double final_value = -2;
  int32_t err = 0;
  EXPECT_EQ(ExpWindCIN(x.Handle(), &final_value, &err), 0);
  EXPECT_EQ(err, TSM_ERR_EXP_FINAL_VALUE);
  EXPECT_EQ(x.Count(), 0);
  // A count below 0 is refused by ScaledWinH alone, with -20004.
  F64 neg{1, 2};
  neg.SetCount(-1);
  EXPECT_EQ(ScaledWinH(neg.Handle(), 1, 0.0, &k), TSM_ERR_NEGATIVE_DIMENSION);
  EXPECT_TRUE(IsLibNaN(k.enbw) && IsLibNaN(k.cg));
  EXPECT_EQ(neg.Count(), 0);
}

TEST_F(WindowEntries, TaperAndForceRules) {
  const V data = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10};
  const auto run = [&](auto call) {
    F64 x(data);
    EXPECT_EQ(call(x.Handle()), 0);
    return x.Values();
  };
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, 0.0); }), data);
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, -3.0); }), data);
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, 0.19); }), data);  // m = 0
  V ends = data;
  ends.front() = ends.back() = 0;
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, 0.2); }), ends);  // m = 1: the ends only
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, 1.0); }),
            run([](F64ArrayHdl x) { return AllCosWinH(x, 1, 0); }));
  EXPECT_EQ(run([](F64ArrayHdl x) { return CosTaperedH(x, 7.5); }),
            run([](F64ArrayHdl x) { return AllCosWinH(x, 1, 0); }));

  EXPECT_EQ(run([](F64ArrayHdl x) { return ForceWinH(x, 150.0); }), data);
  EXPECT_EQ(run([](F64ArrayHdl x) { return ForceWinH(x, 0.0); }), V(10, 0.0));
  EXPECT_EQ(run([](F64ArrayHdl x) { return ForceWinH(x, -20.0); }), V(10, 0.0));
  EXPECT_EQ(run([](F64ArrayHdl x) { return ForceWinH(x, 37.0); }), (V{1, 2, 3, 0, 0, 0, 0, 0, 0, 0}));
  EXPECT_EQ(run([](F64ArrayHdl x) { double d = 99.9; int32_t e; return ForceWindCIN(x, &d, &e) + e; }),
            (V{1, 2, 3, 4, 5, 6, 7, 8, 9, 0}));

  // sigma at or below 0 is 0.2, in both forms.
  for (int form : {0, 1}) {
    for (double s : {0.0, -1.0}) {
      EXPECT_EQ(run([&](F64ArrayHdl x) { return GaussWinH(x, s, form); }),
                run([&](F64ArrayHdl x) { return GaussWinH(x, 0.2, form); }));
    }
  }
}

TEST_F(WindowEntries, SymmetricRectangleAndSingleSample) {
  F64 r(V(5, 2.0));
  ASSERT_EQ(SymmWinH(r.Handle(), 0, 0.0), 0);
  EXPECT_EQ(r.Values(), V(5, 2.0));
  F64 one{4.0};
  EXPECT_EQ(SymmWinH(one.Handle(), 99, 0.0), 0) << "one sample is left alone before the selector is read";
  EXPECT_EQ(one.Values(), V{4.0});
}

// The table as defined, and against the closed forms of a periodic cosine
// sum: cg = a0, enbw = (a0^2 + sum_{k>0} a_k^2 / 2) / a0^2. The table's
// figures agree with those to 3e-6 (Blackman-Nuttall's is the farthest).
TEST_F(WindowEntries, ConstantsTable) {
  struct Row { int sel; double enbw, cg; } rows[] = {
      {0, 1, 1},
      {1, 1.5, 0.5},
      {2, 1.362826, 0.54},
      {3, 1.708538, 0.42323},
      {4, 1.693699, 0.42659071367},
      {5, 1.726757, 0.42},
      {6, 3.770246506303, 0.215578948},
      {7, 2.004353, 0.35875},
      {8, 2.631905, 0.27105140069342415},
      {9, 2.215350782519, 0.323215218},
      {11, 1.9761117, 0.3635819},
  };
  for (const Row& r : rows) {
    WinConsts k{0, 0};
    ASSERT_EQ(WinConstByNameH(64, r.sel, 0.0, &k), 0) << r.sel;
    EXPECT_EQ(k.enbw, r.enbw) << r.sel;
    EXPECT_EQ(k.cg, r.cg) << r.sel;
    const V& a = kCosineCoefficients.at(r.sel);
    double s2 = a[0] * a[0];
    for (size_t i = 1; i < a.size(); ++i) s2 += a[i] * a[i] / 2;
    EXPECT_NEAR(k.enbw, s2 / (a[0] * a[0]), 3e-6 * k.enbw) << r.sel;
    EXPECT_NEAR(k.cg, a[0], 1e-10) << r.sel;
    // ScaledWinH reports the table for cosine sums, also with no samples.
    F64 empty;
    WinConsts s{0, 0};
    EXPECT_EQ(ScaledWinH(empty.Handle(), r.sel, 0.0, &s), 0) << r.sel;
    EXPECT_EQ(s.enbw, r.enbw);
    EXPECT_EQ(s.cg, r.cg);
  }
  // Selectors measured by WinConstByNameH: near the table's figures, not them.
  WinConsts bh{0, 0};
  ASSERT_EQ(WinConstByNameH(1 << 14, 31, 0.0, &bh), 0);
  EXPECT_NEAR(bh.enbw, 1.45584787, 1e-4);
  EXPECT_NE(bh.enbw, 1.45584787);
  EXPECT_NEAR(bh.cg, 0.5, 1e-12);
}

TEST_F(WindowEntries, ConstantsRefusals) {
  // WinConstByNameH leaves its constants alone on failure.
  struct Case {
    int n, sel, want;
  } cases[] = {{0, 1, TSM_ERR_EMPTY}, {-5, 1, TSM_ERR_EMPTY}, {8, 10, TSM_ERR_BAD_SELECTOR},
               {8, 12, TSM_ERR_BAD_SELECTOR}, {8, 35, TSM_ERR_BAD_SELECTOR}, {8, 63, TSM_ERR_BAD_SELECTOR},
               {8, -1, TSM_ERR_BAD_SELECTOR}};
  for (const Case& c : cases) {
    WinConsts k{7, 8};
    EXPECT_EQ(WinConstByNameH(c.n, c.sel, 0.0, &k), c.want) << c.n << " " << c.sel;
    EXPECT_EQ(k.enbw, 7);
    EXPECT_EQ(k.cg, 8);
  }
  // ScaledWinH with no samples: measured selectors fail and write NaN.
  for (int sel : {30, 34, 60, 61, 62}) {
    F64 empty;
    WinConsts k{7, 8};
    EXPECT_EQ(ScaledWinH(empty.Handle(), sel, 2.0, &k), TSM_ERR_EMPTY) << sel;
    EXPECT_TRUE(IsLibNaN(k.enbw) && IsLibNaN(k.cg)) << sel;
  }
  WinConsts k{7, 8};
  F64 empty;
  EXPECT_EQ(NumWinConstH(empty.Handle(), &k), TSM_ERR_EMPTY);
  EXPECT_TRUE(IsLibNaN(k.enbw) && IsLibNaN(k.cg));
  F64 x(V(6, 3.0));
  EXPECT_EQ(ScaledWinH(x.Handle(), 0, 0.0, &k), 0);
  EXPECT_EQ(k.enbw, 1);
  EXPECT_EQ(k.cg, 1);
  EXPECT_EQ(x.Values(), V(6, 3.0));
}

// NumWinConstH against long double sums.
TEST_F(WindowEntries, MeasuredConstantsOfArrays) {
  std::mt19937 rng(5);
  std::uniform_real_distribution<double> u(-0.5, 2);
  for (int n : {1, 2, 3, 10, 1000, 65537}) {
    V w(n);
    for (double& v : w) v = u(rng);
    long double s1 = 0, s2 = 0;
    for (double v : w) s1 += v, s2 += static_cast<long double>(v) * v;
    F64 h(w);
    WinConsts k{0, 0};
    ASSERT_EQ(NumWinConstH(h.Handle(), &k), 0);
    const double cg = static_cast<double>(s1 / n), enbw = static_cast<double>(s2 * n / (s1 * s1));
    // Plain sums of n terms of mixed sign: relative to sum|w|, which is below 2.5 n / |s1| times s1.
    const double cond = 2.5 * n / std::fabs(static_cast<double>(s1));
    EXPECT_NEAR(k.cg, cg, (n + 2) * kEps * cond * std::fabs(cg)) << n;
    EXPECT_NEAR(k.enbw, enbw, (3 * n + 6) * kEps * cond * enbw) << n;
  }
  F64 ones(V(17, 1.0));
  WinConsts k{0, 0};
  ASSERT_EQ(NumWinConstH(ones.Handle(), &k), 0);
  EXPECT_EQ(k.enbw, 1);
  EXPECT_EQ(k.cg, 1);
}

// Scratch exhausted in arena mode: -20001 and an emptied array; windows that
// take no scratch still work.
TEST_F(WindowEntries, ArenaExhaustion) {
  ScopedWorkspace ws(256);
  static WinConsts k;
  const std::vector<Named> needy = {
      {"AllCosWinH", [](F64ArrayHdl x) { return AllCosWinH(x, 8, 0); }},
      {"ParzenWinH", ParzenWinH},
      {"DolChebyWinH", [](F64ArrayHdl x) { return DolChebyWinH(x, 1e3, 1); }},
      {"SymmWinH", [](F64ArrayHdl x) { return SymmWinH(x, 1, 0.0); }},
      {"ScaledWinH", [](F64ArrayHdl x) { return ScaledWinH(x, 62, 0.3, &k); }},
  };
  for (const Named& n : needy) {
    F64 x(V(100, 1.0));
    EXPECT_EQ(n.call(x.Handle()), TSM_ERR_NO_MEMORY) << n.name;
    EXPECT_EQ(x.Count(), 0) << n.name;
  }
  EXPECT_TRUE(IsLibNaN(k.enbw) && IsLibNaN(k.cg));
  WinConsts c{5, 5};
  EXPECT_EQ(WinConstByNameH(100, 32, 0.0, &c), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(c.enbw, 5);
  F64 x(V(100, 1.0));
  EXPECT_EQ(KaiserH(x.Handle(), 4.0), 0);
  EXPECT_EQ(x.Count(), 100);
}

}  // namespace
}  // namespace tsmtest
