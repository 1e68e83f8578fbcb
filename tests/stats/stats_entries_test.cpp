// The statistics entries on hand-made data with known answers, and their
// frame: empty inputs, stale outputs, refused resizes, moving blocks.
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <tuple>
#include <vector>

#include "support/host_arrays.h"

namespace {

using tsmtest::F64;
using tsmtest::I32;
using V = std::vector<double>;
using VI = std::vector<int32_t>;

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
using tsmtest::kEps;
using tsmtest::IsLibNaN;
using tsmtest::Scalar;
using tsmtest::CallScalar;

// Entry runs with stale outputs of a non-zero count.
struct ModeOut {
  int32_t ret;
  V modes;
  bool operator==(const ModeOut&) const = default;
};
ModeOut RunMode(const V& xs, int32_t intervals) {
  F64 x(xs), modes{7.0, 7.0, 7.0};
  const int32_t ret = ModeH(x.Handle(), intervals, modes.Handle());
  return {ret, modes.Values()};
}

struct HistOut {
  int32_t ret, err;
  VI counts;
  V centres;
  bool operator==(const HistOut&) const = default;
};
HistOut RunHistgran(const V& xs, int32_t bins) {
  F64 x(xs), centres{7.0, 7.0, 7.0};
  I32 counts{7, 7, 7};
  HistOut r{0, 0x5A5A5A5A, {}, {}};
  r.ret = histgran_head(x.Handle(), &bins, counts.Handle(), centres.Handle(), &r.err);
  r.counts = counts.Values();
  r.centres = centres.Values();
  return r;
}

struct GenHistOut {
  int32_t ret, err;
  VI counts;
  std::array<int32_t, 3> outliers;  // total, below, above
  bool operator==(const GenHistOut&) const = default;
};
// forcedCount overwrites the count field of the interval array.
GenHistOut RunGenHist(const V& xs, const std::vector<GenHistInterval>& ivs, std::optional<int32_t> forcedCount = {}) {
  F64 x(xs);
  tsmtest::Intervals iv(ivs);
  if (forcedCount) iv.SetCount(*forcedCount);
  I32 counts{7, 7, 7};
  GenHistOutliers out{7, 7, 7};
  GenHistOut r{0, 0x5A5A5A5A, {}, {}};
  r.ret = GenHistH(x.Handle(), iv.Handle(), counts.Handle(), &out, &r.err);
  r.counts = counts.Values();
  r.outliers = {out.total, out.below, out.above};
  return r;
}

// ---- scalar entries -----------------------------------------------------------

TEST(StatsMedian, SmallAndPatternedData) {
  struct Case { V x; double want; };
  const std::vector<Case> cases = {
      {{5}, 5},         {{1, 4}, 2.5},          {{4, 1}, 2.5},        {{3, 1, 2}, 2},
      {{2, 2, 2, 1}, 2}, {{-0.5, -0.25}, -0.375}, {{-INFINITY, 1, INFINITY}, 1}, {{1e300, -1e300, 0, 7}, 3.5},
  };
  for (const Case& c : cases) {
    F64 x(c.x);
    const Scalar r = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
    EXPECT_EQ(r.ret, 0);
    EXPECT_EQ(r.err, 0);
    EXPECT_EQ(r.value, c.want) << "n=" << c.x.size();
  }
  // Orders that trouble a quickselect, every length to 40; small integers, so
  // the mean of the two middle values is exact.
  const std::vector<std::function<double(int, int)>> patterns = {
      [](int i, int) { return i; },         [](int i, int n) { return n - i; },
      [](int, int) { return 3; },           [](int i, int n) { return std::min(i, n - i); },
      [](int i, int) { return i % 2; },     [](int i, int) { return (i * 7) % 11 - 5; },
  };
  for (size_t p = 0; p < patterns.size(); ++p) {
    for (int n = 1; n <= 40; ++n) {
      V xs(n);
      for (int i = 0; i < n; ++i) xs[i] = patterns[p](i, n);
      V s = xs;
      std::sort(s.begin(), s.end());
      const double want = n % 2 ? s[n / 2] : (s[n / 2 - 1] + s[n / 2]) / 2;
      F64 x(xs);
      const Scalar r = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
      EXPECT_EQ(r.value, want) << "pattern " << p << " n=" << n;
      EXPECT_EQ(x.Values(), xs) << "the input must not be permuted";
    }
  }
}

TEST(StatsMedian, NaNAnywhereGivesItsCode) {
  for (const V& xs : {V{kNan}, V{kNan, 1, 2}, V{1, kNan}, V{1, 2, 3, kNan}, V{-kNan, 4, 5, 6, 7}}) {
    F64 x(xs);
    const Scalar r = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
    EXPECT_EQ(r.ret, 0);
    EXPECT_EQ(r.err, TSM_ERR_NAN_ARGUMENT) << "n=" << xs.size();
    EXPECT_TRUE(IsLibNaN(r.value));
  }
}

TEST(StatsMoment, ExactPowersAndOrderChecks) {
  // x - mean is -1, -1, -1, 3: the moment of order k is ((-1)^k 3 + 3^k) / 4,
  // exact in float64 up to k = 32.
  F64 x{0, 0, 0, 4};
  const std::vector<std::pair<int32_t, double>> orders = {
      {1, 0}, {2, 3}, {3, 6}, {4, 21}, {5, 60}, {6, 183}, {7, 546}, {8, 1641},
      {12, 132861}, {31, 154418349070986.0}, {32, 463255047212961.0}};
  for (const auto& [order, want] : orders) {
    int32_t k = order;
    const Scalar r = CallScalar([&](double* v, int32_t* e) { return Moment_head(x.Handle(), &k, v, e); });
    EXPECT_EQ(r.err, 0);
    EXPECT_EQ(r.value, want) << "order " << k;
  }
  F64 empty;
  struct Bad { F64* x; int32_t order; int32_t code; };
  for (Bad b : {Bad{&x, 0, TSM_ERR_ORDER_TOO_LOW}, Bad{&x, -3, TSM_ERR_ORDER_TOO_LOW},
                Bad{&x, std::numeric_limits<int32_t>::min(), TSM_ERR_ORDER_TOO_LOW}, Bad{&empty, 0, TSM_ERR_EMPTY}}) {
    const Scalar r = CallScalar([&](double* v, int32_t* e) { return Moment_head(b.x->Handle(), &b.order, v, e); });
    EXPECT_EQ(r.ret, 0);
    EXPECT_EQ(r.err, b.code) << "order " << b.order;
    EXPECT_TRUE(IsLibNaN(r.value));
  }
}

TEST(StatsMSE, ShorterLengthWithWarning) {
  // Over the first three pairs: (1-2)^2 + (2-4)^2 + (3-6)^2 = 14.
  F64 a{1, 2, 3}, b{2, 4, 6, 8, 10}, c{2, 4, 6};
  struct Case { F64* x; F64* y; int32_t err; };
  for (Case k : {Case{&a, &b, TSM_WARN_LENGTHS_DIFFER}, Case{&b, &a, TSM_WARN_LENGTHS_DIFFER}, Case{&a, &c, 0}}) {
    const Scalar r = CallScalar([&](double* v, int32_t* e) { return MSE_head(k.x->Handle(), k.y->Handle(), v, e); });
    EXPECT_EQ(r.ret, 0);
    EXPECT_EQ(r.err, k.err);
    EXPECT_EQ(r.value, 14.0 / 3.0);
  }
}

TEST(StatsRMS, ComplexMagnitudes) {
  // Every magnitude is 5; five elements take the unrolled part and the tail.
  tsmtest::Cx z({cx{3, 4}, cx{-4, 3}, cx{0, 5}, cx{5, 0}, cx{-3, -4}}), one({cx{3, 4}});
  for (tsmtest::Cx* a : {&z, &one}) {
    double rms = 0;
    EXPECT_EQ(CxRMS_head(a->Handle(), &rms), 0);
    EXPECT_EQ(rms, 5.0);
  }
  F64 x{-2, 2, -2, 2, 2};
  const Scalar r = CallScalar([&](double* v, int32_t* e) { return RMS_head(x.Handle(), v, e); });
  EXPECT_EQ(r.err, 0);
  EXPECT_EQ(r.value, 2.0);
}

// ---- modes --------------------------------------------------------------------

TEST(StatsMode, ExactAndBinnedModes) {
  const double e = kEps;  // 1 + e is the double next to 1
  struct Case { V x; int32_t intervals; V want; };
  const std::vector<Case> cases = {
      {{3.5, 3.5, 3.5, 3.5, 3.5}, 0, {3.5}},
      {{3.5, 3.5, 3.5, 3.5, 3.5}, 1, {3.5}},
      {{3.5, 3.5, 3.5, 3.5, 3.5}, 7, {3.5}},
      {{0, 0}, 0, {0}},
      {{1, 2, 3, 4}, 0, {}},
      {{1.5}, 0, {}},
      {{1.5}, 4, {}},
      // A run is measured from its first element: 1 and 1+e are one run,
      // 1+2e and 1+3e the next, though each neighbour is within eps.
      {{1 + 3 * e, 1, 1 + 2 * e, 1 + e}, 0, {1, 1 + 2 * e}},
      {{1, 1 + e, 1 + 2 * e, 1 + 3 * e, 9, 9, 9}, 0, {9}},
      {{3, 1, 3, 2, 1, 5, 2}, 0, {1, 2, 3}},  // equal runs in ascending order
      {{2, 2, 2, 1, 1}, 0, {2}},
      {{1, 1, 2, 2, 2}, 0, {2}},
      {{-2, 3, -2, 3, 7}, 0, {-2, 3}},
      {{kNan, 1, 1, 2}, 0, {1}},
      {{kNan, kNan, 3}, 0, {}},
      // Bins: 3 bins over [0, 6] are 2 wide with centres 1, 3, 5.
      {{0, 10}, 2, {}},  // fullest bin holds 1
      {{0, 10}, 1, {5}},
      {{0, 0, 6, 6}, 3, {1, 5}},
      {{0, 1, 2, 2, 5, 6}, 3, {1, 3, 5}},
      {{0, 3, 3, 3.5, 6}, 3, {3}},
      {{1, 1 + e}, 4, {1 + e}},  // a range within eps: the one mode is the greatest
  };
  for (const Case& c : cases) {
    const ModeOut r = RunMode(c.x, c.intervals);
    EXPECT_EQ(r, (ModeOut{0, c.want})) << "n=" << c.x.size() << " intervals=" << c.intervals
                                       << " first=" << c.x[0] << " modes=" << r.modes.size();
  }
}

// ---- equal-width histogram ------------------------------------------------------

TEST(StatsHistgran, BinsAndCentres) {
  struct Case { V x; int32_t bins; VI counts; V centres; };
  const std::vector<Case> cases = {
      {{2.5, 2.5, 2.5, 2.5}, 3, {0, 0, 4}, {2.5, 2.5, 2.5}},
      // Width 2; the greatest sample lands in the last bin. Extremes placed in
      // the unrolled part and in the tail of the min/max pass.
      {{1, 2, 8, 3, 4, 0}, 4, {2, 2, 1, 1}, {1, 3, 5, 7}},
      {{4, 0, 1, 2, 3, 5, 6, 7, 8}, 4, {2, 2, 2, 3}, {1, 3, 5, 7}},
      {{-1, 2, 0, 0.5, 0.25, 1.9, -0.6}, 6, {2, 0, 2, 1, 0, 2}, {-0.75, -0.25, 0.25, 0.75, 1.25, 1.75}},
      {{3, 1}, 1, {2}, {2}},
      {{-8, 8}, 2, {1, 1}, {-4, 4}},
  };
  for (const Case& c : cases) {
    const HistOut r = RunHistgran(c.x, c.bins);
    EXPECT_EQ(r, (HistOut{0, 0, c.counts, c.centres})) << "n=" << c.x.size() << " bins=" << c.bins;
  }
}

// ---- general histogram ------------------------------------------------------------

TEST(StatsGenHist, InclusionCodesAtBothBounds) {
  const V xs{1, 2, 1.5, 0, 3, kNan};  // both bounds, inside, below, above, NaN
  struct Case { int32_t inclusion; int32_t count; std::array<int32_t, 3> outliers; };
  const std::vector<Case> cases = {
      {0, 2, {4, 1, 3}},   // [1, 2)
      {1, 2, {4, 2, 2}},   // (1, 2]
      {2, 3, {3, 1, 2}},   // [1, 2]
      {3, 1, {5, 2, 3}},   // (1, 2)
      {7, 6, {0, 0, 0}},   // everything, NaN included
      {-1, 6, {0, 0, 0}},
  };
  for (const Case& c : cases) {
    const GenHistOut r = RunGenHist(xs, {{1, 2, c.inclusion}});
    EXPECT_EQ(r, (GenHistOut{0, 0, {c.count}, c.outliers})) << "inclusion " << c.inclusion;
  }
}

TEST(StatsGenHist, IntervalLayouts) {
  struct Case { const char* what; V x; std::vector<GenHistInterval> ivs; VI counts; std::array<int32_t, 3> outliers; };
  const std::vector<Case> cases = {
      {"overlap", {0.5, 1.5, 2.5}, {{0, 2, 2}, {1, 3, 2}}, {2, 2}, {0, 0, 0}},
      // 1.5 lies between the intervals: in the total only.
      {"gap", {-1, 0.5, 1.5, 2.5, 4, kNan}, {{0, 1, 2}, {2, 3, 2}}, {1, 1}, {4, 1, 2}},
      // Below the first interval ends the sample, whatever follows.
      {"unsorted", {1, 5.5, 7}, {{5, 6, 2}, {0, 10, 2}}, {1, 2}, {1, 1, 0}},
      {"none", {1, 2}, {}, {}, {0, 0, 0}},
  };
  for (const Case& c : cases) EXPECT_EQ(RunGenHist(c.x, c.ivs), (GenHistOut{0, 0, c.counts, c.outliers})) << c.what;
}

// ---- frame ------------------------------------------------------------------------

TEST(StatsFrame, BadSizesGiveTheirCodeAndEmptyOutputs) {
  F64 empty, one{1};
  int32_t k2 = 2, k0 = 0;
  const std::vector<std::pair<const char*, std::function<int32_t(double*, int32_t*)>>> scalars = {
      {"Mean_head", [&](double* v, int32_t* e) { return Mean_head(empty.Handle(), v, e); }},
      {"Median_head", [&](double* v, int32_t* e) { return Median_head(empty.Handle(), v, e); }},
      {"Moment_head", [&](double* v, int32_t* e) { return Moment_head(empty.Handle(), &k2, v, e); }},
      {"Moment_head order 0", [&](double* v, int32_t* e) { return Moment_head(empty.Handle(), &k0, v, e); }},
      {"MSE_head x", [&](double* v, int32_t* e) { return MSE_head(empty.Handle(), one.Handle(), v, e); }},
      {"MSE_head y", [&](double* v, int32_t* e) { return MSE_head(one.Handle(), empty.Handle(), v, e); }},
      {"RMS_head", [&](double* v, int32_t* e) { return RMS_head(empty.Handle(), v, e); }},
      {"CxRMS_head", [&](double* v, int32_t* e) {
         tsmtest::Cx z;
         *e = CxRMS_head(z.Handle(), v);
         return 0;
       }},
  };
  for (const auto& [name, call] : scalars) {
    const Scalar r = CallScalar(call);
    EXPECT_EQ(r.ret, 0) << name;
    EXPECT_EQ(r.err, TSM_ERR_EMPTY) << name;
    EXPECT_TRUE(IsLibNaN(r.value)) << name;
  }
  for (int32_t intervals : {0, 5}) EXPECT_EQ(RunMode({}, intervals), (ModeOut{TSM_ERR_EMPTY, {}}));
  for (auto [xs, bins] : {std::pair{V{}, 3}, std::pair{V{1, 2}, 0}, std::pair{V{1, 2}, -2}})
    EXPECT_EQ(RunHistgran(xs, bins), (HistOut{0, TSM_ERR_EMPTY, {}, {}})) << "bins " << bins;
  EXPECT_EQ(RunGenHist({}, {{0, 1, 2}, {1, 2, 0}}), (GenHistOut{0, TSM_ERR_EMPTY, {}, {0, 0, 0}}));
  // A negative interval count, checked before the samples.
  EXPECT_EQ(RunGenHist({1, 2}, {{0, 1, 2}}, -1), (GenHistOut{0, TSM_ERR_SIZE_PAIR, {}, {0, 0, 0}}));
  EXPECT_EQ(RunGenHist({}, {{0, 1, 2}}, -1), (GenHistOut{0, TSM_ERR_SIZE_PAIR, {}, {0, 0, 0}}));
}

// Fails each resize an entry makes in turn: the host's result or -20001, and
// every output emptied.
TEST(StatsFrame, HostRefusesEachResize) {
  const int64_t liveBefore = tsrt_live_blocks();
  {
    F64 x{0, 1, 1, 2, 6, 6}, centres{7.0};
    I32 counts{7};
    int32_t bins = 3, err = 0;
    const int made = tsmtest::RunFailingEachResize(
        [&] {
          counts.SetCount(1);  // stale count; the block keeps at least one element
          centres.SetCount(1);
          err = 0x5A5A5A5A;
          return histgran_head(x.Handle(), &bins, counts.Handle(), centres.Handle(), &err);
        },
        [&](int k, int32_t ret) {
          EXPECT_EQ(ret, TSRT_MEMORY_FULL) << "resize " << k;
          EXPECT_EQ(err, TSM_ERR_NO_MEMORY) << "resize " << k;
          EXPECT_EQ(counts.Count(), 0) << "resize " << k;
          EXPECT_EQ(centres.Count(), 0) << "resize " << k;
        });
    EXPECT_EQ(made, 2);
    EXPECT_EQ(counts.Values(), (VI{3, 1, 2}));
  }
  {
    F64 x{0, 1, 1, 2, 6, 6}, modes{7.0};
    const int made = tsmtest::RunFailingEachResize(
        [&] {
          modes.SetCount(1);
          return ModeH(x.Handle(), 0, modes.Handle());
        },
        [&](int, int32_t ret) {
          EXPECT_EQ(ret, TSRT_MEMORY_FULL);  // the host's result as it stands
          EXPECT_EQ(modes.Count(), 0);
        });
    EXPECT_EQ(made, 1);
    EXPECT_EQ(modes.Values(), (V{1, 6}));
  }
  {
    F64 x{-1, 0.5, 1.5, 2.5, 4};
    tsmtest::Intervals iv({{0, 1, 2}, {2, 3, 2}});
    I32 counts{7};
    GenHistOutliers out{};
    int32_t err = 0;
    const int made = tsmtest::RunFailingEachResize(
        [&] {
          counts.SetCount(1);
          out = GenHistOutliers{7, 7, 7};
          err = 0x5A5A5A5A;
          return GenHistH(x.Handle(), iv.Handle(), counts.Handle(), &out, &err);
        },
        [&](int, int32_t ret) {
          EXPECT_EQ(ret, TSRT_MEMORY_FULL);
          EXPECT_EQ(err, TSM_ERR_NO_MEMORY);
          EXPECT_EQ(counts.Count(), 0);
          EXPECT_EQ((std::array{out.total, out.below, out.above}), (std::array{0, 0, 0}));
        });
    EXPECT_EQ(made, 1);
    EXPECT_EQ(counts.Values(), (VI{1, 1}));
    EXPECT_EQ(err, 0);
  }
  EXPECT_EQ(tsrt_live_blocks(), liveBefore);
}

TEST(StatsFrame, BlocksThatMoveAtEveryResize) {
  const V xs{4, 0, 1, 1, 2, 3, 5, 6, 7, 8};
  auto runAll = [&] {
    F64 x(xs);
    const Scalar median = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
    return std::tuple{median.value, RunMode(xs, 0), RunMode(xs, 4), RunHistgran(xs, 4),
                      RunGenHist(xs, {{0, 2, 0}, {1, 5, 1}, {6, 7, 3}})};
  };
  tsrt_always_move(0);
  const auto still = runAll();
  tsrt_always_move(1);
  const auto moving = runAll();
  tsrt_always_move(0);
  EXPECT_EQ(still, moving);
  EXPECT_EQ(moving, std::tuple(3.5, ModeOut{0, {1}}, ModeOut{0, {1, 7}}, HistOut{0, 0, {3, 2, 2, 3}, {1, 3, 5, 7}},
                               GenHistOut{0, 0, {3, 4, 0}, {3, 0, 2}}));
}

}  // namespace
