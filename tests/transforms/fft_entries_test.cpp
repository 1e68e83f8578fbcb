// The 1-D FFT entries through host handles: checks and codes, padding and
// truncation, shift layouts, inverses, reserved state and failure paths.
#include <gtest/gtest.h>

#include <cmath>
#include <random>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_fixture.h"
#include "support/random_data.h"
#include "support/reference_dft.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;

// The reference spectrum of `fftSize` samples from `offset`, zero outside x.
std::vector<CxL> Window(const std::vector<cx>& x, int offset, int fftSize) {
  std::vector<CxL> w(fftSize);
  for (int i = 0; i < fftSize; ++i) {
    const long idx = static_cast<long>(offset) + i;
    if (idx >= 0 && idx < static_cast<long>(x.size())) w[i] = CxL(x[idx].re, x[idx].im);
  }
  return ReferenceDft(w);
}

// Index of bin k in an output of n bins.
int Slot(int k, int n, bool shift) { return shift ? ((n / 2 + k) % n + n) % n : (k % n + n) % n; }

double SpectrumError(const Cx& got, const std::vector<CxL>& want, bool shift) {
  const int n = static_cast<int>(want.size());
  EXPECT_EQ(got.Count(), n);
  if (got.Count() != n) return 1;
  return RelativeRms(
      [&](size_t k) {
        const cx z = got.At(Slot(static_cast<int>(k), n, shift));
        return CxL(z.re, z.im);
      },
      want);
}

constexpr double kTol = 1e-14;

using FftEntries = HostRunTest;

// Each forward entry against the reference spectrum of the window it reads:
// padding, truncation, both layouts, and zeros outside the input.
TEST_F(FftEntries, ForwardEntriesMatchTheReferenceWindow) {
  const std::vector<cx> zs = RandomCx(20, 2);
  V xs;
  std::vector<cx> re;
  for (const cx& z : zs) xs.push_back(z.re), re.push_back(cx{z.re, 0});
  struct Case {
    bool complex;
    int offset, fftSize, shift;
  } cases[] = {{false, 0, 20, 0}, {false, 0, 32, 0}, {false, 5, 8, 0}, {false, 5, 30, 1}, {false, 19, 1, 1},
               {false, 3, 17, 1}, {false, 0, 16, 1}, {false, 7, 13, 0}, {true, 0, 20, 1}, {true, 4, 24, 0},
               {true, -3, 10, 1}, {true, 25, 5, 0}, {true, 2, 7, 1}, {true, 0, 8192, 1}};
  for (const Case& c : cases) {
    F64 x(xs);
    Cx z(zs), X{cx{9, 9}};
    PlanHolder* state = nullptr;
    ASSERT_EQ(c.complex ? CxKWFFTH80(z.Handle(), X.Handle(), &state, c.offset, c.fftSize, c.shift)
                        : ReKWFFTH80(x.Handle(), X.Handle(), &state, c.offset, c.fftSize, c.shift),
              0);
    EXPECT_LE(SpectrumError(X, Window(c.complex ? zs : re, c.offset, c.fftSize), c.shift), kTol)
        << c.complex << " " << c.offset << " " << c.fftSize << " " << c.shift;
  }
  // The forwarders take the whole input, without shift.
  F64 x(xs);
  Cx z(zs), X, Z;
  PlanHolder* state = nullptr;
  ASSERT_EQ(ReKWFFTH(x.Handle(), X.Handle(), &state), 0);
  EXPECT_LE(SpectrumError(X, Window(re, 0, 20), false), kTol);
  ASSERT_EQ(CxKWFFTH(z.Handle(), Z.Handle(), &state), 0);
  EXPECT_LE(SpectrumError(Z, Window(zs, 0, 20), false), kTol);
}

TEST_F(FftEntries, ChecksInOrderAndEmptyTheOutput) {
  struct Case { int n, offset, fftSize, want; } cases[] = {
      {0, 5, 0, TSM_ERR_EMPTY},         // empty input first
      {4, 4, 8, TSM_ERR_INDEX_RANGE},   // offset equal to the count
      {4, -1, 8, TSM_ERR_INDEX_RANGE},
      {4, 9, 0, TSM_ERR_INDEX_RANGE},   // offset before size
      {4, 0, 0, TSM_ERR_TRANSFORM_SIZE},
      {4, 0, -3, TSM_ERR_TRANSFORM_SIZE},
  };
  for (const Case& c : cases) {
    F64 x(V(c.n, 1.0));
    Cx X{cx{1, 2}, cx{3, 4}};
    PlanHolder* state = nullptr;
    EXPECT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, c.offset, c.fftSize, 1), c.want) << c.n << " " << c.offset;
    EXPECT_EQ(X.Count(), 0);
    EXPECT_EQ(state, nullptr);
  }
  // The complex entry has no offset test; size and emptiness are checked.
  Cx empty, X{cx{1, 2}};
  PlanHolder* state = nullptr;
  EXPECT_EQ(CxKWFFTH80(empty.Handle(), X.Handle(), &state, 0, 4, 0), TSM_ERR_EMPTY);
  EXPECT_EQ(X.Count(), 0);
  Cx one{cx{1, 0}}, Y{cx{1, 2}};
  EXPECT_EQ(CxKWFFTH80(one.Handle(), Y.Handle(), &state, 0, 0, 0), TSM_ERR_TRANSFORM_SIZE);
  EXPECT_EQ(Y.Count(), 0);
  F64 out{1.0};
  for (auto call : {+[](F64& o) { Cx e; PlanHolder* s = nullptr; return InvReKWFFTH80(e.Handle(), o.Handle(), &s, 0); },
                    +[](F64& o) { F64 e; PlanHolder* s = nullptr; return ReKWFFTHCH(e.Handle(), o.Handle(), &s); },
                    +[](F64& o) { F64 e; PlanHolder* s = nullptr; return InvReKWFFTHCH(e.Handle(), o.Handle(), &s); }}) {
    out.SetCount(1);
    EXPECT_EQ(call(out), TSM_ERR_EMPTY);
    EXPECT_EQ(out.Count(), 0);
  }
}

TEST_F(FftEntries, InversesRestoreTheForwardInput) {
  for (int n : {1, 2, 7, 16, 53, 60}) {
    for (int shift : {0, 1}) {
      const V xs = RandomReal(n, n);
      F64 x(xs), back;
      Cx X;
      PlanHolder* state = nullptr;
      ASSERT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, n, shift), 0);
      ASSERT_EQ(InvReKWFFTH80(X.Handle(), back.Handle(), &state, shift), 0);
      ASSERT_EQ(back.Count(), n);
      for (int i = 0; i < n; ++i) EXPECT_NEAR(back.At(i), xs[i], 1e-14) << n << " " << shift;

      const std::vector<cx> zs = RandomCx(n, n + 100);
      Cx z(zs), Z, zback;
      ASSERT_EQ(CxKWFFTH80(z.Handle(), Z.Handle(), &state, 0, n, shift), 0);
      ASSERT_EQ(InvCxKWFFTH80(Z.Handle(), zback.Handle(), &state, shift), 0);
      for (int i = 0; i < n; ++i) {
        EXPECT_NEAR(zback.At(i).re, zs[i].re, 1e-14);
        EXPECT_NEAR(zback.At(i).im, zs[i].im, 1e-14);
      }
      if (shift != 0) continue;  // the forwarders' inverses take no shift
      ASSERT_EQ(InvReKWFFTH(X.Handle(), back.Handle(), &state), 0);
      ASSERT_EQ(InvCxKWFFTH(Z.Handle(), zback.Handle(), &state), 0);
      for (int i = 0; i < n; ++i) {
        EXPECT_NEAR(back.At(i), xs[i], 1e-14);
        EXPECT_NEAR(zback.At(i).im, zs[i].im, 1e-14);
      }
    }
  }
}

TEST_F(FftEntries, RealInverseReadsOnlyTheNonNegativeHalf) {
  const int n = 10;
  const V xs = RandomReal(n, 5);
  F64 x(xs), back;
  Cx X;
  PlanHolder* state = nullptr;
  ASSERT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, n, 0), 0);
  std::vector<cx> spoiled = X.Values();
  spoiled[0].im = 123;      // imaginary part of bin 0
  spoiled[n / 2].im = -45;  // and of the Nyquist bin
  for (int k = n / 2 + 1; k < n; ++k) spoiled[k] = cx{77, 88};  // negative bins
  Cx Y(spoiled);
  ASSERT_EQ(InvReKWFFTH80(Y.Handle(), back.Handle(), &state, 0), 0);
  for (int i = 0; i < n; ++i) EXPECT_NEAR(back.At(i), xs[i], 1e-14);
}

TEST_F(FftEntries, HalfComplexEntries) {
  for (int n : {1, 2, 9, 16, 23}) {
    const V xs = RandomReal(n, 3 * n);
    std::vector<cx> asCx;
    for (double v : xs) asCx.push_back(cx{v, 0});
    const std::vector<CxL> exact = Window(asCx, 0, n);
    F64 x(xs), y, back;
    PlanHolder* state = nullptr;
    ASSERT_EQ(ReKWFFTHCH(x.Handle(), y.Handle(), &state), 0);
    ASSERT_EQ(y.Count(), n);
    for (int k = 0; 2 * k <= n; ++k) {
      EXPECT_NEAR(y.At(k), static_cast<double>(exact[k].real()), 1e-14) << n << " bin " << k;
      if (k > 0 && 2 * k < n) {
        EXPECT_NEAR(y.At(n - k), static_cast<double>(exact[k].imag()), 1e-14);
      }
    }
    const V packed = y.Values();
    ASSERT_EQ(InvReKWFFTHCH(y.Handle(), back.Handle(), &state), 0);
    for (int i = 0; i < n; ++i) EXPECT_NEAR(back.At(i), xs[i], 1e-14);
    if (n > 2) {
      EXPECT_NE(y.Values(), packed) << "the input block holds scaled Hartley values now";
    }
  }
}

TEST_F(FftEntries, PlainStateRegistersOnceAndFollowsTheLength) {
  F64 x(RandomReal(30, 4));
  Cx X;
  PlanHolder* state = nullptr;
  const int32_t before = tsrt_cleanup_count();
  ASSERT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, 30, 0), 0);
  ASSERT_NE(state, nullptr);
  EXPECT_EQ(tsrt_cleanup_count(), before + 1);
  PlanHolder* const holder = state;
  ASSERT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, 30, 0), 0);
  ASSERT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, 17, 0), 0);  // new length, same holder
  EXPECT_EQ(state, holder);
  EXPECT_EQ(tsrt_cleanup_count(), before + 1);
  kwfft_table* p17 = create_kwfft_table(17);  // the holder keeps 17 alive, not 30
  kwfft_table* p30 = create_kwfft_table(30);
  destroy_kwfft_table(p17);
  destroy_kwfft_table(p30);
  EXPECT_EQ(tsrt_end_run(), before + 1);
}

// The _IDP twins give their plain entries' bits; their state registers nothing
// with the host and goes with TransformUnreserveProc.
TEST_F(FftEntries, EveryTwinMatchesItsPlainEntry) {
  ReservedTransformState* rs = nullptr;
  EXPECT_EQ(TransformUnreserveProc(&rs), 0);  // null: nothing to do
  PlanHolder* ps = nullptr;
  F64 x(RandomReal(16, 8));
  Cx z(RandomCx(16, 9)), a1, a2, f1, f2, r1, r2;
  F64 c1, c2, d1, d2, e1, e2;
  const int32_t before = tsrt_cleanup_count();
  ASSERT_EQ(ReKWFFTH80_IDP(x.Handle(), r2.Handle(), &rs, 0, 12, 1), 0);
  ASSERT_NE(rs, nullptr);
  EXPECT_EQ(tsrt_cleanup_count(), before);
  ASSERT_EQ(ReKWFFTH80(x.Handle(), r1.Handle(), &ps, 0, 12, 1), 0);
  ASSERT_EQ(CxKWFFTH80(z.Handle(), a1.Handle(), &ps, 2, 16, 1), 0);
  ASSERT_EQ(CxKWFFTH80_IDP(z.Handle(), a2.Handle(), &rs, 2, 16, 1), 0);
  ASSERT_EQ(InvReKWFFTH80(a1.Handle(), c1.Handle(), &ps, 1), 0);
  ASSERT_EQ(InvReKWFFTH80_IDP(a1.Handle(), c2.Handle(), &rs, 1), 0);
  ASSERT_EQ(InvCxKWFFTH80(a1.Handle(), f1.Handle(), &ps, 1), 0);
  ASSERT_EQ(InvCxKWFFTH80_IDP(a1.Handle(), f2.Handle(), &rs, 1), 0);
  ASSERT_EQ(ReKWFFTHCH(x.Handle(), d1.Handle(), &ps), 0);
  ASSERT_EQ(ReKWFFTHCH_IDP(x.Handle(), d2.Handle(), &rs), 0);
  ASSERT_EQ(InvReKWFFTHCH(d1.Handle(), e1.Handle(), &ps), 0);
  ASSERT_EQ(InvReKWFFTHCH_IDP(d2.Handle(), e2.Handle(), &rs), 0);
  auto same = [](const Cx& p, const Cx& q) {
    for (int k = 0; k < p.Count(); ++k)
      if (p.At(k).re != q.At(k).re || p.At(k).im != q.At(k).im) return false;
    return p.Count() == q.Count();
  };
  EXPECT_TRUE(same(r1, r2));
  EXPECT_TRUE(same(a1, a2));
  EXPECT_TRUE(same(f1, f2));
  EXPECT_EQ(c1.Values(), c2.Values());
  EXPECT_EQ(d1.Values(), d2.Values());
  EXPECT_EQ(e1.Values(), e2.Values());
  EXPECT_EQ(TransformUnreserveProc(&rs), 0);
  EXPECT_EQ(rs, nullptr);
}

TEST_F(FftEntries, ARefusedResizeReturnsTheHostsValueAndLeaksNothing) {
  const V xs = RandomReal(10, 10);
  const std::vector<cx> zs = RandomCx(10, 11);
  using Call = std::function<int32_t()>;
  F64 x(xs), y{1.0};
  Cx z(zs), X{cx{1, 1}};
  PlanHolder* ps = nullptr;
  ReservedTransformState* rs = nullptr;
  struct Entry {
    const char* name;
    Call call;
    std::function<int32_t()> outputCount;
  };
  const auto countX = [&] { return X.Count(); };
  const auto countY = [&] { return y.Count(); };
  const std::vector<Entry> entries = {
      {"ReKWFFTH80", [&] { return ReKWFFTH80(x.Handle(), X.Handle(), &ps, 0, 16, 1); }, countX},
      {"CxKWFFTH80_IDP", [&] { return CxKWFFTH80_IDP(z.Handle(), X.Handle(), &rs, 3, 16, 1); }, countX},
      {"InvReKWFFTH80", [&] { return InvReKWFFTH80(z.Handle(), y.Handle(), &ps, 1); }, countY},
      {"InvCxKWFFTH80", [&] { return InvCxKWFFTH80(z.Handle(), X.Handle(), &ps, 1); }, countX},
      {"ReKWFFTHCH", [&] { return ReKWFFTHCH(x.Handle(), y.Handle(), &ps); }, countY},
  };
  for (const Entry& entry : entries) {
    const int made = RunFailingEachResize(entry.call, [&](int k, int32_t result) {
      EXPECT_EQ(result, TSRT_MEMORY_FULL) << entry.name << " resize " << k;
      EXPECT_EQ(entry.outputCount(), 0) << entry.name << " resize " << k;
    });
    EXPECT_EQ(made, 1) << entry.name;
  }
  TransformUnreserveProc(&rs);
}

TEST_F(FftEntries, ArenaExhaustionReachesTheEntry) {
  ScopedWorkspace ws(64);
  F64 x(RandomReal(5, 12));
  Cx X;
  PlanHolder* state = nullptr;
  // Padding 5 samples to 64 needs scratch that a 64-byte arena cannot give.
  EXPECT_EQ(ReKWFFTH80(x.Handle(), X.Handle(), &state, 0, 64, 0), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(X.Count(), 0);
}

}  // namespace
}  // namespace tsmtest
