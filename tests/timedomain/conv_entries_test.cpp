// Convolution, correlation and deconvolution entries through host handles:
// checks in order, emptied outputs, resize failures, autocorrelation and
// both paths of deconvolution.
#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <random>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_fixture.h"
#include "support/host_matrix.h"
#include "support/random_data.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;

V DirectConvolution(const V& a, const V& b) {
  std::vector<long double> r(a.size() + b.size() - 1);
  for (size_t i = 0; i < a.size(); ++i)
    for (size_t j = 0; j < b.size(); ++j) r[i + j] += static_cast<long double>(a[i]) * b[j];
  return V(r.begin(), r.end());
}

using ConvEntries = HostRunTest;

TEST_F(ConvEntries, FormAChecksAndEmptiesTheOutput) {
  struct Case { int n, m; int32_t alg, norm, want; } cases[] = {
      {0, 3, 0, 0, TSM_ERR_EMPTY}, {3, 0, 1, 0, TSM_ERR_EMPTY},
      {3, 4, 0, 3, TSM_ERR_BAD_SELECTOR},  // unknown normalization, after the sums
      {3, 4, 1, -1, TSM_ERR_BAD_SELECTOR}, {3, 4, 5, 9, TSM_ERR_BAD_SELECTOR},
  };
  for (const Case& c : cases) {
    F64 x(V(c.n, 1.0)), y(V(c.m, 2.0)), out{7.0, 8.0};
    int32_t err = 0, alg = c.alg;
    EXPECT_EQ(Rxy80(x.Handle(), y.Handle(), out.Handle(), &alg, c.norm, &err), 0);
    EXPECT_EQ(err, c.want) << c.n << " " << c.m << " " << c.norm;
    EXPECT_EQ(out.Count(), 0);
  }
  // An unknown algorithm is no error: the result has its length.
  F64 x(V(4, 1.0)), y(V(3, 1.0)), out;
  int32_t err = 1, alg = 5;
  EXPECT_EQ(Rxy80(x.Handle(), y.Handle(), out.Handle(), &alg, 2, &err), 0);
  EXPECT_EQ(err, 0);
  EXPECT_EQ(out.Count(), 6);
  EXPECT_EQ(Convolution(x.Handle(), y.Handle(), out.Handle(), &alg, &err), 0);
  EXPECT_EQ(err, 0);
  EXPECT_EQ(out.Count(), 6);
}

TEST_F(ConvEntries, ComplexConvolutionChecks) {
  Cx x{cx{1, 1}, cx{2, 0}}, y{cx{0, 1}}, empty;
  struct Case { Cx* a; int32_t alg, correlate, norm, want; } cases[] = {
      {&x, 0, 1, 3, TSM_ERR_BAD_SELECTOR},     {&empty, 0, 1, -1, TSM_ERR_BAD_SELECTOR},  // before the sizes
      {&empty, 0, 0, 77, TSM_ERR_EMPTY},       {&x, 2, 0, 0, TSM_ERR_BAD_SELECTOR},
      {&x, 0, 0, 77, TSM_SUCCESS},             {&x, 1, 1, 2, TSM_SUCCESS},
  };
  for (const Case& c : cases) {
    Cx out{cx{5, 5}};
    EXPECT_EQ(CxConvolution(c.a->Handle(), y.Handle(), out.Handle(), c.alg, c.correlate, c.norm), c.want);
    EXPECT_EQ(out.Count(), c.want == 0 ? 2 : 0);
  }
}

TEST_F(ConvEntries, MatrixChecksInOrder) {
  struct Case { int r1, c1, r2, c2; int32_t size, alg, want; } cases[] = {
      {0, 2, 2, 2, 9, 0, TSM_ERR_EMPTY},      {2, 2, 2, 0, 0, 0, TSM_ERR_EMPTY},
      {2, 2, 2, 2, 3, 0, TSM_ERR_BAD_SELECTOR}, {2, 2, 2, 2, -1, 0, TSM_ERR_BAD_SELECTOR},
      {2, 3, 3, 2, 2, 0, TSM_ERR_SIZE_PAIR},  {2, 2, 2, 2, 2, 7, TSM_ERR_BAD_SELECTOR},
      {3, 3, 2, 2, 1, -1, TSM_ERR_BAD_SELECTOR},
  };
  for (const Case& c : cases) {
    Mat x(c.r1, c.c1, V(c.r1 * c.c1, 1.0)), y(c.r2, c.c2, V(c.r2 * c.c2, 1.0)), out(1, 1, {3.0});
    EXPECT_EQ(Convolve_2DH(x.Handle(), y.Handle(), out.Handle(), c.size, c.alg), c.want) << c.r1 << c.size << c.alg;
    EXPECT_EQ(out.Rows(), 0);
    EXPECT_EQ(out.Cols(), 0);
  }
  // Valid with equal sizes: one value, the sum of the products with y turned.
  Mat x(2, 2, {1, 2, 3, 4}), y(2, 2, {5, 6, 7, 8}), out;
  ASSERT_EQ(Convolve_2DH(x.Handle(), y.Handle(), out.Handle(), 2, 1), 0);
  ASSERT_EQ(out.Values().size(), 1u);
  EXPECT_NEAR(out.Values()[0], 1 * 8 + 2 * 7 + 3 * 6 + 4 * 5, 1e-13);
  CxMat a(1, 1, {cx{1, 0}}), b(0, 3, {}), o(1, 1, {cx{1, 1}});
  EXPECT_EQ(CxCorrelation_2DH(a.Handle(), b.Handle(), o.Handle(), 0), TSM_ERR_EMPTY);
  EXPECT_EQ(o.Rows(), 0);
  EXPECT_EQ(CxCorrelation_2DH(a.Handle(), a.Handle(), o.Handle(), 3), TSM_ERR_BAD_SELECTOR);
}

// Zero lag at index n - 1; unbiased (1) divides each lag by its number of
// products, biased (2) all of them by n.
TEST_F(ConvEntries, AutoCorrelationAgainstLongDoubleSums) {
  for (int n : {1, 2, 7, 64, 101}) {
    const V xs = RandomReal(n, n), sums = DirectConvolution(V(xs.rbegin(), xs.rend()), xs);
    for (int32_t norm : {0, 1, 2}) {
      F64 x(xs);
      int32_t err = 1;
      ASSERT_EQ(AutoCorrelation80(x.Handle(), norm, &err), 0);
      ASSERT_EQ(err, 0);
      ASSERT_EQ(x.Count(), 2 * n - 1);
      for (int k = 0; k < 2 * n - 1; ++k) {
        const double count = norm == 1 ? n - std::abs(k - (n - 1)) : norm == 2 ? n : 1;
        EXPECT_NEAR(x.At(k), sums[k] / count, 64 * kEps * n) << n << " " << norm << " " << k;
      }
    }
  }
  F64 x(V(5, 1.0));
  int32_t err = 0;
  ASSERT_EQ(AutoCorrelation(x.Handle(), &err), 0);
  const V want = {1, 2, 3, 4, 5, 4, 3, 2, 1};
  for (int k = 0; k < 9; ++k) EXPECT_NEAR(x.At(k), want[k], 1e-14);
  F64 empty;
  EXPECT_EQ(AutoCorrelation80(empty.Handle(), 0, &err), 0);
  EXPECT_EQ(err, TSM_ERR_EMPTY);
  F64 y{1.0, 2.0};
  EXPECT_EQ(AutoCorrelation80(y.Handle(), 4, &err), 0);
  EXPECT_EQ(err, TSM_ERR_BAD_SELECTOR);
  EXPECT_EQ(y.Count(), 0);
}

TEST_F(ConvEntries, DeconvolutionRecoversTheQuotientByEitherPath) {
  struct Case { V y; int q; const char* path; } cases[] = {
      {{2.0, -0.5, 0.25}, 40, "spectral"},
      {{1.5}, 1, "spectral, one sample"},
      {RandomReal(9, 3), 1, "spectral, n == m"},
      {{1.0, 1.0}, 31, "zero at the Nyquist bin"},
      {{0.0, 0.0, 1.0, 1.0}, 13, "leading zeros and a spectral zero"},
      {{1.0, 0.0, 1.0}, 10, "zero at a quarter of the rate"},
  };
  for (const Case& c : cases) {
    const V q = RandomReal(c.q, c.q + 17);
    F64 x(DirectConvolution(q, c.y)), y(c.y);
    int32_t err = 1;
    ASSERT_EQ(Deconvolution(x.Handle(), y.Handle(), &err), 0);
    ASSERT_EQ(err, 0) << c.path;
    ASSERT_EQ(x.Count(), c.q) << c.path;
    for (int i = 0; i < c.q; ++i) EXPECT_NEAR(x.At(i), q[i], 1e-12) << c.path << " " << i;
  }
}

TEST_F(ConvEntries, DeconvolutionChecksInOrder) {
  struct Case {
    int32_t n, m, want;
  } cases[] = {{8388609, 2, TSM_ERR_NEGATIVE_TRANSFORM_SIZE}, {0, 8388609, TSM_ERR_NEGATIVE_TRANSFORM_SIZE},
               {0, 2, TSM_ERR_EMPTY}, {3, 0, TSM_ERR_EMPTY}, {3, 4, TSM_ERR_SIZE_PAIR}};
  for (const Case& c : cases) {
    // Only the counts are read before these checks fail.
    F64 x(V(4, 1.0)), y(V(4, 1.0));
    x.SetCount(c.n);
    y.SetCount(c.m);
    int32_t err = 0;
    EXPECT_EQ(Deconvolution(x.Handle(), y.Handle(), &err), 0);
    EXPECT_EQ(err, c.want) << c.n << " " << c.m;
    EXPECT_EQ(x.Count(), 0);
  }
}

TEST_F(ConvEntries, ResizeFailureAtEachResize) {
  const V a = RandomReal(6, 1), b = RandomReal(4, 2);
  F64 x(a), y(b), out;
  int32_t alg = 1, err = 0;
  // Convolution stands for Rxy80 too, which shares its frame.
  const int made = RunFailingEachResize([&] { return Convolution(x.Handle(), y.Handle(), out.Handle(), &alg, &err); },
                                        [&](int k, int32_t ret) {
                                          EXPECT_NE(ret, 0) << k;
                                          EXPECT_EQ(err, TSM_ERR_NO_MEMORY) << k;
                                          EXPECT_EQ(out.Count(), 0) << k;
                                        });
  EXPECT_EQ(made, 1);
  EXPECT_EQ(err, 0);
  // A refused resize of the autocorrelation: it still runs (into scratch) and its code replaces -20001.
  F64 t(a);
  for (const auto& [norm, code] : {std::pair{1, 0}, std::pair{7, int{TSM_ERR_BAD_SELECTOR}}}) {
    tsrt_fail_resize_at(1);
    EXPECT_NE(AutoCorrelation80(t.Handle(), norm, &err), 0);
    tsrt_fail_resize_at(0);
    EXPECT_EQ(err, code);
    EXPECT_EQ(t.Count(), static_cast<int32_t>(a.size()));
  }
  // Deconvolution makes one resize, in place.
  F64 q(DirectConvolution(a, b)), q2(DirectConvolution(a, b));
  tsrt_fail_resize_at(1);
  EXPECT_NE(Deconvolution(q.Handle(), y.Handle(), &err), 0);
  tsrt_fail_resize_at(0);
  EXPECT_EQ(err, TSM_ERR_NO_MEMORY);
  EXPECT_EQ(q.Count(), 0);
  const int64_t before = tsrt_resize_calls();
  EXPECT_EQ(Deconvolution(q2.Handle(), y.Handle(), &err), 0);
  EXPECT_EQ(err, 0);
  EXPECT_EQ(tsrt_resize_calls() - before, 1);

  Cx cxa{cx{1, 2}, cx{3, 4}}, cxb{cx{0, 1}}, cout;
  RunFailingEachResize([&] { return CxConvolution(cxa.Handle(), cxb.Handle(), cout.Handle(), 1, 1, 1); },
                       [&](int, int32_t ret) {
                         EXPECT_EQ(ret, TSRT_MEMORY_FULL);  // the host's own result
                         EXPECT_EQ(cout.Count(), 0);
                       });
  Mat m1(3, 3, RandomReal(9, 4)), m2(2, 2, RandomReal(4, 5)), mout;
  RunFailingEachResize([&] { return Convolve_2DH(m1.Handle(), m2.Handle(), mout.Handle(), 1, 1); },
                       [&](int, int32_t ret) {
                         EXPECT_EQ(ret, TSM_ERR_NO_MEMORY);
                         EXPECT_EQ(mout.Rows() + mout.Cols(), 0);
                       });
}

TEST_F(ConvEntries, ArenaServesTheScratchAndItsExhaustionIsReported) {
  ScopedWorkspace ws(1 << 20);
  const V a = RandomReal(300, 8), b = RandomReal(200, 9);
  const V want = DirectConvolution(a, b);
  F64 x(a), y(b), out;
  int32_t err = 1, alg = 1;
  ASSERT_EQ(Convolution(x.Handle(), y.Handle(), out.Handle(), &alg, &err), 0);
  EXPECT_EQ(err, 0);
  for (size_t k = 0; k < want.size(); ++k) EXPECT_NEAR(out.At(static_cast<int32_t>(k)), want[k], 1e-12);
  const V big = RandomReal(100000, 10);
  F64 bx(big), by(big);
  ASSERT_EQ(Convolution(bx.Handle(), by.Handle(), out.Handle(), &alg, &err), 0);
  EXPECT_EQ(err, TSM_ERR_NO_MEMORY);
  EXPECT_EQ(out.Count(), 0);
}

}  // namespace
}  // namespace tsmtest
