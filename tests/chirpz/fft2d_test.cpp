// The 2-D FFT entries through host handles: windows with offsets, padding and
// truncation, both shift layouts, inverses, checks and state.
#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_fixture.h"
#include "support/random_data.h"
#include "support/host_matrix.h"
#include "support/reference_dft.h"

namespace tsmtest {
namespace {

using CV = std::vector<cx>;

// The rows x cols window from (ro, co), zero outside the input.
CV Window(const CV& x, int inR, int inC, int ro, int co, int rows, int cols) {
  CV w(rows * cols, cx{0, 0});
  for (int r = 0; r < rows; ++r)
    for (int c = 0; c < cols; ++c)
      if (ro + r < inR && co + c < inC) w[r * cols + c] = x[(ro + r) * inC + co + c];
  return w;
}

// The 2-D DFT by its defining sum in long double.
std::vector<CxL> Dft2D(const CV& w, int rows, int cols) {
  std::vector<CxL> X(rows * cols);
  for (int kr = 0; kr < rows; ++kr)
    for (int kc = 0; kc < cols; ++kc)
      for (int r = 0; r < rows; ++r)
        for (int c = 0; c < cols; ++c) {
          const long double ang =
              -2 * kPiL * (static_cast<long double>((kr * r) % rows) / rows + static_cast<long double>((kc * c) % cols) / cols);
          X[kr * cols + kc] += CxL(w[r * cols + c].re, w[r * cols + c].im) * CxL(cosl(ang), sinl(ang));
        }
  return X;
}

int Slot(int k, int n, bool shift) { return shift ? (n / 2 + k) % n : k; }

using Fft2D = HostRunTest;

struct Frame {
  int inR, inC, ro, co, rows, cols, shift;
};
const Frame kFrames[] = {{1, 1, 0, 0, 1, 1, 1}, {4, 6, 0, 0, 4, 6, 0}, {5, 7, 1, 2, 6, 8, 1}, {6, 9, 0, 0, 3, 4, 1},
                         {7, 5, 2, 0, 7, 5, 1}, {3, 8, 0, 3, 53, 2, 0}, {2, 2, 1, 1, 5, 3, 1}, {9, 1, 0, 0, 1, 9, 1}};

TEST_F(Fft2D, ForwardAgreesWithTheDefiningSum) {
  for (const Frame& f : kFrames) {
    const CV xs = RandomCx(f.inR * f.inC, f.inR * 31 + f.inC);
    std::vector<double> re;
    CV reAsCx;
    for (const cx& z : xs) re.push_back(z.re), reAsCx.push_back(cx{z.re, 0});
    const auto want = Dft2D(Window(xs, f.inR, f.inC, f.ro, f.co, f.rows, f.cols), f.rows, f.cols);
    const auto wantRe = Dft2D(Window(reAsCx, f.inR, f.inC, f.ro, f.co, f.rows, f.cols), f.rows, f.cols);
    CxMat x(f.inR, f.inC, xs), X, Xi;
    Mat r(f.inR, f.inC, re);
    CxMat R, Ri;
    PlanHolder *sc = nullptr, *sr = nullptr;
    ReservedTransformState* state = nullptr;
    ASSERT_EQ(CxFFT2D_H(x.Handle(), f.ro, f.co, f.rows, f.cols, f.shift, X.Handle(), &sc, &sr), 0);
    ASSERT_EQ(ReFFT2D_H(r.Handle(), f.ro, f.co, f.rows, f.cols, f.shift, R.Handle(), &sc, &sr), 0);
    ASSERT_EQ(CxFFT2D_H_IDP(x.Handle(), f.ro, f.co, f.rows, f.cols, f.shift, Xi.Handle(), &state), 0);
    ASSERT_EQ(ReFFT2D_H_IDP(r.Handle(), f.ro, f.co, f.rows, f.cols, f.shift, Ri.Handle(), &state), 0);
    for (const CxMat* m : {&X, &R, &Xi, &Ri}) {
      ASSERT_EQ(m->Rows(), f.rows);
      ASSERT_EQ(m->Cols(), f.cols);
    }
    const CV got = X.Values(), gotRe = R.Values();
    EXPECT_EQ(Xi.Values().size(), got.size());
    for (int kr = 0; kr < f.rows; ++kr)
      for (int kc = 0; kc < f.cols; ++kc) {
        const int at = Slot(kr, f.rows, f.shift) * f.cols + Slot(kc, f.cols, f.shift);
        const double tol = 64 * kEps * f.rows * f.cols;
        EXPECT_LE(std::abs(CxL(got[at].re, got[at].im) - want[kr * f.cols + kc]), tol) << kr << " " << kc;
        EXPECT_LE(std::abs(CxL(gotRe[at].re, gotRe[at].im) - wantRe[kr * f.cols + kc]), tol) << kr << " " << kc;
        EXPECT_EQ(Xi.Values()[at].re, got[at].re);
        EXPECT_EQ(Ri.Values()[at].im, gotRe[at].im);
      }
    if (f.rows == 1 && f.cols == 1) {
      EXPECT_EQ(gotRe[0].im, 0.0);
      EXPECT_EQ(gotRe[0].re, re[0]);
    }
    EXPECT_EQ(TransformUnreserveProc(&state), 0);
  }
}

TEST_F(Fft2D, InversesUndoTheShiftInBothDimensions) {
  for (const Frame& f : kFrames) {
    const CV w = Window(RandomCx(f.inR * f.inC, 5), f.inR, f.inC, f.ro, f.co, f.rows, f.cols);
    std::vector<double> re;
    for (const cx& z : w) re.push_back(z.re);
    CxMat x(f.rows, f.cols, w), X, back;
    Mat r(f.rows, f.cols, re), rback;
    CxMat R;
    PlanHolder *sc = nullptr, *sr = nullptr;
    ReservedTransformState* state = nullptr;
    ASSERT_EQ(CxFFT2D_H(x.Handle(), 0, 0, f.rows, f.cols, f.shift, X.Handle(), &sc, &sr), 0);
    ASSERT_EQ(CxInvFFT2D_H_IDP(X.Handle(), f.shift, back.Handle(), &state), 0);
    ASSERT_EQ(ReFFT2D_H_IDP(r.Handle(), 0, 0, f.rows, f.cols, f.shift, R.Handle(), &state), 0);
    ASSERT_EQ(ReInvFFT2D_H(R.Handle(), f.shift, rback.Handle(), &sc, &sr), 0);
    ASSERT_EQ(back.Rows(), f.rows);
    ASSERT_EQ(rback.Cols(), f.cols);
    const CV b = back.Values();
    const std::vector<double> rb = rback.Values();
    for (size_t i = 0; i < w.size(); ++i) {
      EXPECT_NEAR(b[i].re, w[i].re, 1e-14);
      EXPECT_NEAR(b[i].im, w[i].im, 1e-14);
      EXPECT_NEAR(rb[i], re[i], 1e-14);
    }
    EXPECT_EQ(TransformUnreserveProc(&state), 0);
  }
}

TEST_F(Fft2D, ChecksInOrderEmptyTheOutput) {
  struct Case { int inR, inC, ro, co, rows, cols; int32_t want; } cases[] = {
      {0, 3, 5, 5, 0, 0, TSM_ERR_EMPTY},       {3, 3, 3, 0, 0, 2, TSM_ERR_INDEX_RANGE},
      {3, 3, 0, 3, 2, 2, TSM_ERR_INDEX_RANGE}, {3, 3, 0, 0, 0, 2, TSM_ERR_SIZE_PAIR},
      {3, 3, 0, 0, 2, -1, TSM_ERR_SIZE_PAIR},  {3, 3, -1, 0, 2, 2, TSM_ERR_INDEX_RANGE},
  };
  for (const Case& c : cases) {
    Mat x(c.inR, c.inC, std::vector<double>(c.inR * c.inC, 1.0));
    CxMat xc(c.inR, c.inC, CV(c.inR * c.inC, cx{1, 0}));
    CxMat X(1, 1, {cx{1, 1}}), Y(1, 1, {cx{1, 1}});
    PlanHolder *sc = nullptr, *sr = nullptr;
    EXPECT_EQ(ReFFT2D_H(x.Handle(), c.ro, c.co, c.rows, c.cols, 0, X.Handle(), &sc, &sr), c.want);
    EXPECT_EQ(CxFFT2D_H(xc.Handle(), c.ro, c.co, c.rows, c.cols, 1, Y.Handle(), &sc, &sr), c.want);
    EXPECT_EQ(X.Rows() + X.Cols() + Y.Rows() + Y.Cols(), 0) << c.ro << " " << c.rows;
  }
  CxMat empty(2, 0, {});
  Mat out(1, 1, {1.0});
  ReservedTransformState* state = nullptr;
  EXPECT_EQ(ReInvFFT2D_H_IDP(empty.Handle(), 0, out.Handle(), &state), TSM_ERR_EMPTY);
  EXPECT_EQ(out.Rows(), 0);
  EXPECT_EQ(TransformUnreserveProc(&state), 0);
}

TEST_F(Fft2D, StatesAndResizeFailures) {
  Mat x(3, 4, std::vector<double>(12, 1.0));
  CxMat X, back;
  PlanHolder *sc = nullptr, *sr = nullptr;
  const int32_t before = tsrt_cleanup_count();
  ASSERT_EQ(ReFFT2D_H(x.Handle(), 0, 0, 3, 4, 1, X.Handle(), &sc, &sr), 0);
  EXPECT_EQ(tsrt_cleanup_count(), before + 2);  // one holder per dimension
  ASSERT_NE(sc, sr);
  ReservedTransformState* state = nullptr;
  ASSERT_EQ(CxInvFFT2D_H_IDP(X.Handle(), 1, back.Handle(), &state), 0);
  EXPECT_EQ(tsrt_cleanup_count(), before + 2);  // the reserved record registers nothing
  RunFailingEachResize([&] { return ReFFT2D_H(x.Handle(), 0, 0, 3, 4, 0, X.Handle(), &sc, &sr); },
                       [&](int, int32_t r) {
                         EXPECT_EQ(r, TSRT_MEMORY_FULL);
                         EXPECT_EQ(X.Rows(), 0);
                       });
  RunFailingEachResize([&] { return CxInvFFT2D_H_IDP(X.Handle(), 0, back.Handle(), &state); },
                       [&](int, int32_t r) {
                         EXPECT_EQ(r, TSRT_MEMORY_FULL);
                         EXPECT_EQ(back.Cols(), 0);
                       });
  EXPECT_EQ(TransformUnreserveProc(&state), 0);
}

}  // namespace
}  // namespace tsmtest
