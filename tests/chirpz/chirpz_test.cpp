// Chirp-Z, its inverse and the zoom transform through host handles, against
// mpmath golden values (tools/golden/conv_golden.py) and long double sums.
#include <gtest/gtest.h>

#include <cmath>
#include <complex>
#include <fstream>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_fixture.h"
#include "support/random_data.h"
#include "support/reference_dft.h"

namespace tsmtest {
namespace {

using CV = std::vector<cx>;

double Dist(cx a, CxL b) { return static_cast<double>(std::abs(CxL(a.re, a.im) - b)); }

using ChirpZ = HostRunTest;

// Off the unit circle the terms' moduli spread exponentially, and Bluestein's
// convolution is good only relative to its largest terms: the bound is 16 eps
// of each term's modulus times (1 + i |log A| + i k |log W|), summed.
TEST_F(ChirpZ, GoldenSpiralsByBothMethods) {
  std::ifstream in(TSM_TEST_DATA "/conv_golden.txt");
  std::string s;
  int cases = 0;
  while (std::getline(in, s)) {
    std::istringstream ss(s);
    std::string kind;
    ss >> kind;
    if (kind != "czt") continue;
    ++cases;
    int n, M;
    std::string t;
    ss >> n >> M;
    const auto next = [&] { ss >> t; return std::strtod(t.c_str(), nullptr); };
    const double are = next(), aim = next(), wre = next(), wim = next();
    cx A{are, aim}, W{wre, wim};
    CV x(n), want(M);
    for (cx& z : x) z = cx{next(), next()};
    for (cx& z : want) z = cx{next(), next()};
    const double la = std::abs(std::log(std::complex<double>(A.re, A.im)));
    const double lw = std::abs(std::log(std::complex<double>(W.re, W.im)));
    for (int32_t method : {0, 1}) {
      Cx hx(x), X;
      ASSERT_EQ(CxChirpZT_head(hx.Handle(), &A, &W, M, method, X.Handle()), 0);
      ASSERT_EQ(X.Count(), M);
      for (int k = 0; k < M; ++k) {
        double bound = 0;
        for (int i = 0; i < n; ++i)
          bound += std::hypot(x[i].re, x[i].im) * std::pow(std::hypot(A.re, A.im), -i) *
                   std::pow(std::hypot(W.re, W.im), double(i) * k) * (1 + i * la + double(i) * k * lw);
        EXPECT_LE(Dist(X.At(k), CxL(want[k].re, want[k].im)), 16 * kEps * bound) << n << " " << M << " " << k;
      }
    }
  }
  EXPECT_EQ(cases, 6);
}

// sum_i x[i] W^(i k) in long double for the W given (a rounded
// exp(-2 pi i / n), whose modulus is 1 only to rounding, which matters at
// i k ~ 10^8): W^k from the exact modulus and angle of W, its powers by
// repeated products (good to n 2^-64).
std::vector<CxL> UnitCircleReference(const std::vector<double>& x, cx W) {
  const size_t n = x.size();
  const long double theta = atan2l(W.im, W.re), r = hypotl(W.re, W.im);
  std::vector<CxL> X(n);
  for (size_t k = 0; k < n; ++k) {
    const CxL wk = std::polar(powl(r, k), theta * k);
    CxL p = 1, acc = 0;
    for (size_t i = 0; i < n; ++i, p *= wk) acc += static_cast<long double>(x[i]) * p;
    X[k] = acc;
  }
  return X;
}

// With A = 1 and W = exp(-2 pi i / n) the transform is the DFT. Both methods
// are held to 64 eps of the rms up to n = 10^4, an FFT-like bound: the worst
// measured is 17 eps (Bluestein at n = 10007).
TEST_F(ChirpZ, UnitCircleGivesTheDftOfARealInput) {
  for (int n : {1, 2, 7, 64, 509, 10007}) {
    const std::vector<double> xs = RandomReal(n, n);
    cx A{1, 0}, W{std::cos(2 * M_PI / n), -std::sin(2 * M_PI / n)};
    const std::vector<CxL> want = UnitCircleReference(xs, W);
    for (int32_t method : {0, 1}) {
      if (method == 0 && n > 1000) continue;  // n^2 complex powers
      F64 x(xs);
      Cx X;
      ASSERT_EQ(ChirpZT_head(x.Handle(), &A, &W, 0, method, X.Handle()), 0);  // outputSize 0: n bins
      ASSERT_EQ(X.Count(), n);
      const double err =
          RelativeRms([&](size_t k) { const cx z = X.At(int32_t(k)); return CxL(z.re, z.im); }, want);
      EXPECT_LE(err, 64 * kEps) << n << " method " << method;
    }
  }
}

TEST_F(ChirpZ, ChecksInOrder) {
  const double nan = std::nan(""), inf = INFINITY;
  struct Case { int n; cx A, W; int32_t method, want; } cases[] = {
      {0, {0, 0}, {nan, 0}, 7, TSM_ERR_EMPTY},
      {3, {0, 0}, {nan, 0}, 2, TSM_ERR_BAD_SELECTOR},
      {3, {1, 0}, {1, 0}, -1, TSM_ERR_BAD_SELECTOR},
      {3, {0, 0}, {nan, 0}, 1, TSM_ERR_NON_FINITE},  // non-finite before zero
      {3, {1, inf}, {1, 0}, 0, TSM_ERR_NON_FINITE},
      {3, {0, 0}, {1, 0}, 0, TSM_ERR_NOTHING_TO_FIT},
      {3, {1, 0}, {0, -0.0}, 1, TSM_ERR_NOTHING_TO_FIT},
  };
  for (Case c : cases) {
    Cx x(CV(c.n, cx{1, 1})), X{cx{1, 1}};
    EXPECT_EQ(CxChirpZT_head(x.Handle(), &c.A, &c.W, 4, c.method, X.Handle()), c.want) << c.n << " " << c.method;
    EXPECT_EQ(X.Count(), 0);
  }
  F64 x{1.0, 2.0};
  Cx X;
  cx A{1, 0}, W{0, 1};
  RunFailingEachResize([&] { return ChirpZT_head(x.Handle(), &A, &W, 5, 1, X.Handle()); },
                       [&](int, int32_t r) {
                         EXPECT_EQ(r, TSM_ERR_NO_MEMORY);
                         EXPECT_EQ(X.Count(), 0);
                       });
  EXPECT_EQ(X.Count(), 5);
}

TEST_F(ChirpZ, InverseRecoversTheSamples) {
  struct Case { int M, n; cx A, W; } cases[] = {
      {16, 16, {1, 0}, {std::cos(2 * M_PI / 16), -std::sin(2 * M_PI / 16)}},
      {12, 12, {1.05 * std::cos(0.3), 1.05 * std::sin(0.3)}, {0.98 * std::cos(0.5), -0.98 * std::sin(0.5)}},
      {5, 9, {0.9, 0.1}, {std::cos(1.1), std::sin(1.1)}},
      {1, 4, {2, 0}, {0, 1}},
      {64, 64, {1.1 * std::cos(0.2), 1.1 * std::sin(0.2)}, {std::cos(2 * M_PI / 64), -std::sin(2 * M_PI / 64)}},
  };
  // The points W^k of these spirals keep the Vandermonde system well
  // conditioned (an arc of clustered points would not be); the worst error
  // measured is 2e-12, from the growth of A^k on the 64-point spiral.
  for (Case c : cases) {
    const CV x0 = RandomCx(c.M, c.M + 1);
    Cx x(x0), X, back;
    ASSERT_EQ(CxChirpZT_head(x.Handle(), &c.A, &c.W, c.n, 0, X.Handle()), 0);
    ASSERT_EQ(InvChirpZT_head(X.Handle(), &c.A, &c.W, c.M == c.n ? 0 : c.M, back.Handle()), 0);
    ASSERT_EQ(back.Count(), c.M);
    for (int i = 0; i < c.M; ++i) EXPECT_LE(Dist(back.At(i), CxL(x0[i].re, x0[i].im)), 1e-11) << c.M << " " << i;
  }
  // Checks: empty, more outputs than inputs, the spiral, coinciding points.
  const double nan = std::nan("");
  struct Bad { int n, M; cx A, W; int32_t want; } bad[] = {{0, 0, {1, 0}, {0, 1}, TSM_ERR_EMPTY},
             {3, 4, {1, 0}, {0, 1}, TSM_ERR_SIZE_PAIR},
             {3, 2, {1, 0}, {nan, 1}, TSM_ERR_NON_FINITE},
             {3, 2, {0, 0}, {0, 1}, TSM_ERR_NOTHING_TO_FIT},
             {3, 3, {1, 0}, {1, 0}, TSM_ERR_ZERO_DIVISOR}};
  for (Bad b : bad) {
    Cx X(CV(b.n, cx{1, 0})), x{cx{3, 3}};
    EXPECT_EQ(InvChirpZT_head(X.Handle(), &b.A, &b.W, b.M, x.Handle()), b.want) << b.n << " " << b.M;
    EXPECT_EQ(x.Count(), 0);
  }
}

// The zoom reference: the input folded as defined (blocks of P from index m
// added onto the first P values), then the DFT sum of length P at bins k + q.
std::vector<CxL> ZoomReference(CV x, int a, int m, int k, int Q) {
  const long P = long(a) * m, n = long(x.size());
  for (long start = m; n > P && start < n; start += P)
    for (long j = 0; j < std::min(P, n - start); ++j) x[j] = cx{x[j].re + x[start + j].re, x[j].im + x[start + j].im};
  std::vector<CxL> X(Q);
  for (int q = 0; q < Q; ++q)
    for (long t = 0; t < std::min(n, P); ++t) {
      const long double ang = -2 * kPiL * static_cast<long double>((t * (long(k) + q)) % P) / P;
      X[q] += CxL(x[t].re, x[t].im) * CxL(cosl(ang), sinl(ang));
    }
  return X;
}

TEST_F(ChirpZ, ZoomPicksBinsOfTheLongDft) {
  struct Case {
    int n, a, m, k, Q;
  } cases[] = {{16, 1, 16, 0, 16}, {20, 3, 8, -5, 12}, {24, 3, 8, 30, 7}, {50, 2, 10, 7, 5}, {9, 4, 5, -23, 9},
               {1, 1, 1, 0, 3}};
  for (const Case& c : cases) {
    const CV xs = RandomCx(c.n, c.n);
    std::vector<double> re;
    CV reAsCx;
    for (const cx& z : xs) re.push_back(z.re), reAsCx.push_back(cx{z.re, 0});
    const std::vector<CxL> want = ZoomReference(xs, c.a, c.m, c.k, c.Q), wantRe = ZoomReference(reAsCx, c.a, c.m, c.k, c.Q);
    Cx x(xs), X, Xi;
    F64 r(re);
    Cx R;
    PlanHolder* state = nullptr;
    ReservedTransformState* reserved = nullptr;
    ASSERT_EQ(CxDZTH(x.Handle(), c.a, c.m, c.k, c.Q, X.Handle(), &state), 0);
    ASSERT_EQ(ReDZTH_IDP(r.Handle(), c.a, c.m, c.k, c.Q, R.Handle(), &reserved), 0);
    ASSERT_EQ(X.Count(), c.Q);
    ASSERT_EQ(R.Count(), c.Q);
    const double bound = 64 * kEps * (c.n + c.Q);
    for (int q = 0; q < c.Q; ++q) {
      EXPECT_LE(Dist(X.At(q), want[q]), bound) << c.n << " " << c.k << " " << q;
      EXPECT_LE(Dist(R.At(q), wantRe[q]), bound) << c.n << " " << c.k << " " << q;
    }
    if (c.n > c.a * c.m) {
      EXPECT_NE(x.At(0).re, xs[0].re) << "long inputs are folded in the caller's array";
    }
    EXPECT_EQ(TransformUnreserveProc(&reserved), 0);
  }
}

TEST_F(ChirpZ, ZoomChecksInOrder) {
  struct Case {
    int n, a, m, Q;
    int32_t want;
  } cases[] = {{0, 0, 0, 0, TSM_ERR_ORDER_TOO_LOW}, {4, 1, 0, 3, TSM_ERR_TRANSFORM_SIZE},
               {0, 2, 4, 0, TSM_ERR_TRANSFORM_SIZE}, {0, 2, 4, 3, TSM_SUCCESS}};
  for (const Case& c : cases) {
    F64 x(std::vector<double>(c.n, 1.0));
    Cx X{cx{1, 1}};
    PlanHolder* state = nullptr;
    EXPECT_EQ(ReDZTH(x.Handle(), c.a, c.m, 0, c.Q, X.Handle(), &state), c.want);
    EXPECT_EQ(X.Count(), 0);
  }
  Cx x(RandomCx(10, 3)), X;
  PlanHolder* state = nullptr;
  RunFailingEachResize([&] { return CxDZTH(x.Handle(), 2, 5, 1, 4, X.Handle(), &state); },
                       [&](int, int32_t r) {
                         EXPECT_EQ(r, TSRT_MEMORY_FULL);
                         EXPECT_EQ(X.Count(), 0);
                       });
}

}  // namespace
}  // namespace tsmtest
