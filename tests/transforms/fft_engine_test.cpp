// The FFT engine: factorisation and plan cache, and every transform against
// an independent long double DFT.
#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <vector>

#include "support/random_data.h"
#include "support/reference_dft.h"
#include "transforms/kwfft.h"

namespace tsmtest {
namespace {

using tsm::kwfft_table;

constexpr double kEps = 2.220446049250313e-16;

// Error of a plan's trigonometric tables against directly evaluated values:
// per level the largest twiddle or root error, or the rms error of a Rader
// spectrum plus twice that of its nested plan (run twice per Rader step).
double TableError(const kwfft_table* p) {
  double total = 0;
  int length = p->n;
  for (int i = 0; i < p->factor_count; ++i) {
    const tsm::kwfft_stage* st = p->stages[i];
    const int r = p->factors[i], m = length / r;
    double e = 0;
    auto entry = [&](double c, double s, long long num, long long den) {
      const long double a = -2 * kPiL * static_cast<long double>(num) / static_cast<long double>(den);
      e = std::max(e, static_cast<double>(fabsl(c - cosl(a)) + fabsl(s - sinl(a))));
    };
    if (st->tw_cos != nullptr)
      for (int k = 1; k < m; ++k)
        for (int j = 1; j < r; ++j) {
          const long long at = static_cast<long long>(k - 1) * (r - 1) + (j - 1);
          entry(st->tw_cos[at], st->tw_sin[at], static_cast<long long>(j) * k % length, length);
        }
    if (st->root_cos != nullptr)
      for (int q = 0; q < r; ++q) entry(st->root_cos[q], st->root_sin[q], q, r);
    if (st->rader_plan != nullptr) {
      std::vector<CxL> b(r - 1);
      for (int k = 0; k < r - 1; ++k) {
        const long double a = -2 * kPiL * st->rader_scatter[k + 1] / r;
        b[k] = CxL(cosl(a), sinl(a)) / static_cast<long double>(r - 1);
      }
      const std::vector<CxL> spectrum = ReferenceDft(b);
      e = std::max(e, RelativeRms([&](size_t k) { return CxL(st->rader_cos[k], st->rader_sin[k]); }, spectrum)) +
          2 * TableError(st->rader_plan);
    }
    total += e;
    length = m;
  }
  return total;
}

// rms error bound for a transform of length n: a few eps per level of the
// recursion, plus the error of the recurrence tables themselves (which grows
// with the table lengths, most along chains of nested Rader plans).
double Bound(const kwfft_table* p) {
  return 10 * kEps * std::max(1.0, std::log2(static_cast<double>(p->n))) + TableError(p);
}

struct Plan {
  kwfft_table* p;
  explicit Plan(int n) : p(tsm::CreateKwfftTable(n)) {}
  ~Plan() { tsm::DestroyKwfftTable(p); }
};

std::vector<CxL> ToCx(const std::vector<double>& re, const std::vector<double>& im) {
  std::vector<CxL> z(re.size());
  for (size_t i = 0; i < re.size(); ++i) z[i] = CxL(re[i], im.empty() ? 0.0 : im[i]);
  return z;
}

struct Errors {
  double complexForward, complexInverse, realForward, realInverse;
};

// All four transforms of length n against the reference, as rms errors
// relative to the rms of the exact result.
Errors TransformErrors(int n) {
  Plan plan(n);
  EXPECT_NE(plan.p, nullptr) << n;
  if (plan.p == nullptr) return {1, 1, 1, 1};
  const std::vector<double> xr = RandomReal(n, 2 * n), xi = RandomReal(n, 2 * n + 1);
  const std::vector<CxL> exact = ReferenceDft(ToCx(xr, xi));
  // The spectrum of the real part alone: (X[k] + conj X[n-k]) / 2.
  std::vector<CxL> exactReal(n);
  for (int k = 0; k < n; ++k) exactReal[k] = (exact[k] + std::conj(exact[(n - k) % n])) / 2.0L;
  std::vector<double> yr(n), yi(n), h(n), zr(n), zi(n), back(n);
  Errors e{};

  EXPECT_EQ(tsm::kwfft_complex(plan.p, xr.data(), xi.data(), yr.data(), yi.data(), 1, 1, n), 0);
  e.complexForward = RelativeRms([&](size_t k) { return CxL(yr[k], yi[k]); }, exact);

  // Inverse of the exact spectrum rounded to double: back to the signal.
  std::vector<double> sr(n), si(n);
  for (int k = 0; k < n; ++k) {
    sr[k] = static_cast<double>(exact[k].real());
    si[k] = static_cast<double>(exact[k].imag());
  }
  EXPECT_EQ(tsm::kwfft_complex_inverse(plan.p, sr.data(), si.data(), zr.data(), zi.data(), 1, 1, n), 0);
  e.complexInverse = RelativeRms([&](size_t k) { return CxL(zr[k], zi[k]); }, ToCx(xr, xi));

  EXPECT_EQ(tsm::kwfft_real(plan.p, xr.data(), h.data(), 1, 1, n), 0);
  e.realForward = RelativeRms([&](size_t k) { return FromHalfComplex(h, k); }, exactReal);

  const std::vector<long double> hc = ToHalfComplex(exactReal);
  h.assign(hc.begin(), hc.end());
  EXPECT_EQ(tsm::kwfft_real_inverse(plan.p, h.data(), back.data(), 1, 1, n), 0);
  e.realInverse = RelativeRms([&](size_t k) { return CxL(back[k]); }, ToCx(xr, {}));
  return e;
}

void ExpectAccurate(int n) {
  const Errors e = TransformErrors(n);
  const Plan plan(n);
  const double bound = Bound(plan.p);
  EXPECT_LE(e.complexForward, bound) << "complex forward n=" << n;
  EXPECT_LE(e.complexInverse, bound) << "complex inverse n=" << n;
  EXPECT_LE(e.realForward, bound) << "real forward n=" << n;
  EXPECT_LE(e.realInverse, bound) << "real inverse n=" << n;
}

TEST(KwfftPlan, FactorListsAndKinds) {
  struct Case { int n; std::vector<int> factors, kinds; };
  const Case cases[] = {
      {60, {2, 3, 10}, {0, 0, 0}},          {1000, {10, 10, 10}, {0, 0, 0}},
      {64, {2, 32}, {0, 0}},                {1024, {32, 32}, {0, 0}},
      {96, {3, 32}, {0, 0}},                {2048, {2, 32, 32}, {0, 0, 0}},
      {128, {4, 32}, {0, 0}},               {4096, {4, 32, 32}, {0, 0, 0}},
      {256, {8, 32}, {0, 0}},               {8192, {8, 32, 32}, {0, 0, 0}},
      {512, {16, 32}, {0, 0}},              {65536, {2, 32, 32, 32}, {0, 0, 0, 0}},
      {720, {4, 10, 18}, {0, 0, 0}},        {44100, {7, 7, 9, 10, 10}, {0, 0, 0, 0, 0}},
      {23, {23}, {1}},                      {48000, {3, 10, 10, 10, 16}, {0, 0, 0, 0, 0}},
      {46, {2, 23}, {0, 1}},                {529, {23, 23}, {1, 1}},
      {53, {53}, {2}},                      {106, {2, 53}, {0, 2}},
      {47, {47}, {1}},                      {2, {2}, {0}},
      {43, {43}, {0}},                      {1, {}, {}},
      {23 * 47 * 53, {23, 47, 53}, {1, 1, 2}},
  };
  for (const Case& c : cases) {
    Plan plan(c.n);
    ASSERT_NE(plan.p, nullptr);
    EXPECT_EQ(plan.p->n, c.n);
    std::vector<int> f(plan.p->factors, plan.p->factors + plan.p->factor_count);
    std::vector<int> k(plan.p->kinds, plan.p->kinds + plan.p->factor_count);
    EXPECT_EQ(f, c.factors) << c.n;
    EXPECT_EQ(k, c.kinds) << c.n;
    // Twiddles for every factor but the last, none for a single factor.
    for (int i = 0; i < plan.p->factor_count; ++i)
      EXPECT_EQ(plan.p->stages[i]->tw_cos != nullptr, i + 1 < plan.p->factor_count) << c.n << " level " << i;
  }
}

TEST(KwfftPlan, CacheSharesAndCountsPlans) {
  int plans = -1, refs = -1;
  tsm::KwfftCacheCensus(&plans, &refs);
  ASSERT_EQ(plans, 0);
  EXPECT_EQ(tsm::CreateKwfftTable(0), nullptr);
  EXPECT_EQ(tsm::CreateKwfftTable(-7), nullptr);
  tsm::DestroyKwfftTable(nullptr);

  kwfft_table* a = tsm::CreateKwfftTable(107);
  kwfft_table* b = tsm::CreateKwfftTable(107);
  ASSERT_NE(a, nullptr);
  EXPECT_EQ(a, b);
  // 107 holds 106 = 2 * 53, whose Rader factor 53 holds 52 = 4 * 13.
  const kwfft_table* n106 = a->stages[0]->rader_plan;
  ASSERT_NE(n106, nullptr);
  EXPECT_EQ(n106->n, 106);
  EXPECT_EQ(n106->kinds[1], tsm::kKindRader);
  const kwfft_table* n52 = n106->stages[1]->rader_plan;
  EXPECT_EQ(n52->n, 52);
  EXPECT_EQ((std::vector<int>(n52->factors, n52->factors + n52->factor_count)), (std::vector<int>{4, 13}));
  tsm::KwfftCacheCensus(&plans, &refs);
  EXPECT_EQ(plans, 3);
  EXPECT_EQ(refs, 4);

  kwfft_table* c = tsm::CreateKwfftTable(53);  // a plan of its own, sharing 52
  EXPECT_EQ(c->stages[0]->rader_plan, n52);
  tsm::KwfftCacheCensus(&plans, &refs);
  EXPECT_EQ(plans, 4);
  EXPECT_EQ(refs, 6);
  tsm::DestroyKwfftTable(c);
  tsm::DestroyKwfftTable(a);
  tsm::KwfftCacheCensus(&plans, &refs);
  EXPECT_EQ(plans, 3);  // b still holds 107
  tsm::DestroyKwfftTable(b);
  tsm::KwfftCacheCensus(&plans, &refs);
  EXPECT_EQ(plans, 0);
  EXPECT_EQ(refs, 0);
}

TEST(KwfftPlan, NextSmoothLength) {
  EXPECT_EQ(tsm::kwfft_next_smooth_length(1), 1);
  EXPECT_EQ(tsm::kwfft_next_smooth_length(23), 24);
  EXPECT_EQ(tsm::kwfft_next_smooth_length(46), 48);
  EXPECT_EQ(tsm::kwfft_next_smooth_length(47), 48);
  EXPECT_EQ(tsm::kwfft_next_smooth_length(53), 54);
  EXPECT_EQ(tsm::kwfft_next_smooth_length(1009), 1014);  // 1010 = 2*5*101, 1012 = 4*11*23
  for (int n = 2; n < 3000; ++n) {
    const int m = tsm::kwfft_next_smooth_length(n);
    EXPECT_GE(m, n);
    EXPECT_NE(m % 23, 0) << n;
    EXPECT_NE(m % 47, 0) << n;
  }
}

TEST(KwfftTransform, EveryLengthUpTo4096) {
  for (int n = 1; n <= 4096; ++n) ExpectAccurate(n);
}

TEST(KwfftTransform, LargeAndAwkwardLengths) {
  for (int n : {8192, 32768, 44100, 48000, 65536, 65537, 1 << 20, 3 << 18, 4099, 10007, 23 * 47 * 53,
                2 * 3 * 5 * 7 * 11 * 13 * 17})
    ExpectAccurate(n);
}

TEST(KwfftTransform, StridedAndInterleavedData) {
  for (int n : {1, 12, 53, 96, 230}) {
    Plan plan(n);
    const std::vector<double> xr = RandomReal(n, 7), xi = RandomReal(n, 8);
    const std::vector<CxL> exact = ReferenceDft(ToCx(xr, xi));
    // Interleaved input at a 4-byte offset, output every third element.
    std::vector<unsigned char> raw(4 + 16 * n);
    auto* in = reinterpret_cast<double*>(raw.data() + 4);
    for (int i = 0; i < n; ++i) {
      std::memcpy(raw.data() + 4 + 16 * i, &xr[i], 8);
      std::memcpy(raw.data() + 12 + 16 * i, &xi[i], 8);
    }
    std::vector<double> out(3 * n + 3, 99.0);
    ASSERT_EQ(tsm::kwfft_complex(plan.p, in, in + 1, out.data(), out.data() + 1, 2, 3, n), 0);
    EXPECT_LE(RelativeRms([&](size_t k) { return CxL(out[3 * k], out[3 * k + 1]); }, exact), Bound(plan.p)) << n;
    for (int k = 0; k < n; ++k) EXPECT_EQ(out[3 * k + 2], 99.0) << "gap written, n=" << n;
  }
}

TEST(KwfftTransform, ALengthMismatchWritesNothing) {
  Plan plan(16);
  std::vector<double> in(32, 1.0), out(32, 5.0);
  EXPECT_EQ(tsm::kwfft_complex(plan.p, in.data(), in.data(), out.data(), out.data() + 16, 1, 1, 15), -1);
  EXPECT_EQ(tsm::kwfft_complex_inverse(plan.p, in.data(), in.data(), out.data(), out.data() + 16, 1, 1, 17), -1);
  EXPECT_EQ(tsm::kwfft_real(plan.p, in.data(), out.data(), 1, 1, 8), TSM_ERR_INTERNAL);
  EXPECT_EQ(tsm::kwfft_real_inverse(plan.p, in.data(), out.data(), 1, 1, 8), TSM_ERR_INTERNAL);
  EXPECT_EQ(out, std::vector<double>(32, 5.0));
  EXPECT_EQ(in, std::vector<double>(32, 1.0));
}

TEST(KwfftHalfComplex, UnpackAndPackWithAndWithoutShift) {
  for (int n : {1, 2, 3, 4, 5, 8, 9, 10}) {
    Plan plan(n);
    const std::vector<double> x = RandomReal(n, 11);
    const std::vector<CxL> exact = ReferenceDft(ToCx(x, {}));
    for (int shift : {0, 1}) {
      std::vector<tsm::cx> spectrum(n, tsm::cx{7.0, 7.0});
      ASSERT_EQ(tsm::kwfft_real(plan.p, x.data(), &spectrum[0].re, 1, 2, n), 0);
      tsm::kwfft_unpack_halfcomplex(spectrum.data(), n, shift);
      for (int k = -(n - 1) / 2; k <= n / 2; ++k) {
        const int at = shift ? (n / 2 + k) % n : (k + n) % n;
        const CxL want = exact[(k + n) % n];
        EXPECT_NEAR(spectrum[at].re, static_cast<double>(want.real()), 1e-14) << n << " " << shift << " bin " << k;
        EXPECT_NEAR(spectrum[at].im, static_cast<double>(want.imag()), 1e-14) << n << " " << shift << " bin " << k;
      }
      EXPECT_EQ(spectrum[shift ? n / 2 : 0].im, 0.0);  // exactly 0, not rounding noise
      if (n % 2 == 0) {
        EXPECT_EQ(spectrum[shift ? 0 : n / 2].im, 0.0);
      }
      std::vector<double> hc(n, -1.0), direct(n);
      tsm::kwfft_pack_halfcomplex(spectrum.data(), n, shift, hc.data());
      ASSERT_EQ(tsm::kwfft_real(plan.p, x.data(), direct.data(), 1, 1, n), 0);
      EXPECT_EQ(hc, direct) << n << " " << shift;
    }
  }
}

}  // namespace
}  // namespace tsmtest
