// The statistics entries against exact references made by
// tools/golden/stats_golden.py (tests/data/stats_golden.txt), once on the C
// heap and once with the analysis workspace enabled.
//
// Tolerances, with eps = 2.220446049250313e-16 and n samples:
//   mean      (n+1) eps * sum|x|/n: a left-to-right sum of n terms is good to
//             (n-1) eps relative to sum|x|, the division adds one rounding.
//   rms       (n/2+3) eps relative: n squares summed (all positive, so relative
//             to the result), one division, the square root halves the error
//             and adds one rounding. CxRMS_head sums 2n squares: (n+3) eps.
//   moment k  eps * ((n+2k+2) A_k + k (n+1) (sum|x|/n) A_{k-1}), A_j being
//             sum|x-mean|^j / n: the power of a rounded difference is good to
//             (k+3) eps for k <= 6, the sum adds n; the computed mean is off by
//             up to (n+1) eps sum|x|/n, which moves the k-th moment by k times
//             that times A_{k-1}. This is what large offsets cost.
//   mse       (m+4) eps * sum(x^2 + |y||y-2x|)/m over the m pairs: each term
//             x^2 + y(y-2x) is good to about 4 eps of those magnitudes.
//   centres   (2b+4) eps * max(|lower|, |upper|, upper-lower) for bin b, a
//             running sum of b widths.
//   median, counts, exact modes, general histogram: exact.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <fstream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"

namespace {

using tsmtest::F64;
using tsmtest::I32;

using tsmtest::kEps;
using tsmtest::IsLibNaN;
using tsmtest::Scalar;
using tsmtest::CallScalar;

struct ScalarCase {
  std::string kind, set, set2;  // set2: the y of mse
  int32_t k = 0;                // moment order
  double value = 0;
};
struct HistCase {
  std::string set;
  int32_t bins = 0;
  double lower = 0, upper = 0;
  std::vector<int32_t> counts;
  std::vector<double> centres;
};
struct ModeCase {
  std::string set;
  int32_t intervals = 0;
  std::vector<double> modes;
};
struct GenHistCase {
  std::string set;
  std::vector<GenHistInterval> intervals;
  std::vector<int32_t> counts;
  int32_t total = 0, below = 0, above = 0;
};

struct Golden {
  std::map<std::string, std::vector<double>> sets;
  std::vector<ScalarCase> scalars;
  std::vector<HistCase> hists;
  std::vector<ModeCase> modes;
  std::vector<GenHistCase> genhists;
};

Golden Load() {
  std::ifstream file(TSM_TEST_DATA "/stats_golden.txt");
  std::stringstream in;
  for (std::string line; std::getline(file, line);)
    if (!line.empty() && line[0] != '#') in << line << '\n';
  auto word = [&] { std::string s; in >> s; return s; };
  auto num = [&] { return std::strtod(word().c_str(), nullptr); };
  auto i32 = [&] { return static_cast<int32_t>(std::stol(word())); };
  auto many = [&](int32_t n, auto read) {
    std::vector<decltype(read())> v;
    for (int32_t i = 0; i < n; ++i) v.push_back(read());
    return v;
  };
  Golden g;
  for (std::string kind; in >> kind;) {
    if (kind == "set") {
      const std::string name = word();
      g.sets[name] = many(i32(), num);
    } else if (kind == "mean" || kind == "median" || kind == "rms" || kind == "cxrms" || kind == "moment" ||
               kind == "mse") {
      ScalarCase c;
      c.kind = kind;
      c.set = word();
      if (kind == "moment") c.k = i32();
      if (kind == "mse") c.set2 = word();
      c.value = num();
      g.scalars.push_back(c);
    } else if (kind == "hist") {
      HistCase c;
      c.set = word();
      c.bins = i32();
      c.lower = num();
      c.upper = num();
      c.counts = many(c.bins, i32);
      c.centres = many(c.bins, num);
      g.hists.push_back(c);
    } else if (kind == "mode") {
      ModeCase c;
      c.set = word();
      c.intervals = i32();
      c.modes = many(i32(), num);
      g.modes.push_back(c);
    } else if (kind == "genhist") {
      GenHistCase c;
      c.set = word();
      c.intervals = many(i32(), [&] { return GenHistInterval{num(), num(), i32()}; });
      c.counts = many(static_cast<int32_t>(c.intervals.size()), i32);
      c.total = i32();
      c.below = i32();
      c.above = i32();
      g.genhists.push_back(c);
    } else {
      ADD_FAILURE() << "unknown record " << kind;
      break;
    }
  }
  return g;
}

const Golden& TheGolden() {
  static const Golden g = Load();
  return g;
}

long double MeanAbs(const std::vector<double>& x, long double centre, int power) {
  long double s = 0;
  for (double v : x) s += std::pow(std::fabs(v - centre), static_cast<long double>(power));
  return s / x.size();
}

double CentreTolerance(double lower, double upper, int32_t b) {
  return (2.0 * b + 4) * kEps * std::max({std::fabs(lower), std::fabs(upper), upper - lower});
}

void CheckScalars() {
  const Golden& g = TheGolden();
  for (const ScalarCase& c : g.scalars) {
    SCOPED_TRACE(c.kind + " " + c.set + " " + c.set2 + " k=" + std::to_string(c.k));
    const std::vector<double>& xs = g.sets.at(c.set);
    const auto n = static_cast<long double>(xs.size());
    F64 x(xs);
    Scalar r{};
    long double tol = 0;
    int32_t wantErr = 0;
    if (c.kind == "mean") {
      r = CallScalar([&](double* v, int32_t* e) { return Mean_head(x.Handle(), v, e); });
      tol = (n + 1) * kEps * MeanAbs(xs, 0, 1);
    } else if (c.kind == "median") {
      r = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
    } else if (c.kind == "rms") {
      r = CallScalar([&](double* v, int32_t* e) { return RMS_head(x.Handle(), v, e); });
      tol = (n / 2 + 3) * kEps * c.value;
    } else if (c.kind == "cxrms") {
      std::vector<cx> z(xs.size() / 2);
      for (size_t i = 0; i < z.size(); ++i) z[i] = cx{xs[2 * i], xs[2 * i + 1]};
      tsmtest::Cx zx(z);
      // Form B: the code is the result, and there is no error out-argument.
      r = CallScalar([&](double* v, int32_t*) { return CxRMS_head(zx.Handle(), v); });
      r.err = 0;
      tol = (n / 2 + 3) * kEps * c.value;
    } else if (c.kind == "moment") {
      int32_t k = c.k;
      r = CallScalar([&](double* v, int32_t* e) { return Moment_head(x.Handle(), &k, v, e); });
      long double mean = 0;
      for (double v : xs) mean += v;
      mean /= n;
      tol = kEps * ((n + 2 * k + 2) * MeanAbs(xs, mean, k) + k * (n + 1) * MeanAbs(xs, 0, 1) * MeanAbs(xs, mean, k - 1));
    } else if (c.kind == "mse") {
      const std::vector<double>& ys = g.sets.at(c.set2);
      F64 y(ys);
      r = CallScalar([&](double* v, int32_t* e) { return MSE_head(x.Handle(), y.Handle(), v, e); });
      const size_t m = std::min(xs.size(), ys.size());
      long double scale = 0;
      for (size_t i = 0; i < m; ++i)
        scale += static_cast<long double>(xs[i]) * xs[i] + std::fabs(static_cast<long double>(ys[i]) * (ys[i] - 2.0L * xs[i]));
      tol = (m + 4) * kEps * scale / m;
      wantErr = xs.size() == ys.size() ? 0 : 20004;
    }
    EXPECT_EQ(r.ret, 0);
    EXPECT_EQ(r.err, wantErr);
    const long double error = std::fabs(static_cast<long double>(r.value) - c.value);
    EXPECT_LE(error, tol) << std::hexfloat << "got " << r.value << " want " << c.value;
  }
}

void CheckHistograms() {
  const Golden& g = TheGolden();
  for (const HistCase& c : g.hists) {
    SCOPED_TRACE(c.set + " bins=" + std::to_string(c.bins));
    F64 x(g.sets.at(c.set));
    I32 counts{9, 9, 9};
    F64 centres{9.0};
    int32_t bins = c.bins, err = 77;
    EXPECT_EQ(histgran_head(x.Handle(), &bins, counts.Handle(), centres.Handle(), &err), 0);
    EXPECT_EQ(err, 0);
    EXPECT_EQ(counts.Values(), c.counts);
    ASSERT_EQ(centres.Count(), c.bins);
    for (int32_t b = 0; b < c.bins; ++b)
      EXPECT_NEAR(centres.At(b), c.centres[b], CentreTolerance(c.lower, c.upper, b)) << "bin " << b;
  }
}

void CheckModes() {
  const Golden& g = TheGolden();
  for (const ModeCase& c : g.modes) {
    SCOPED_TRACE(c.set + " intervals=" + std::to_string(c.intervals));
    const std::vector<double>& xs = g.sets.at(c.set);
    F64 x(xs);
    F64 modes{7.0, 7.0};
    EXPECT_EQ(ModeH(x.Handle(), c.intervals, modes.Handle()), 0);
    ASSERT_EQ(modes.Count(), static_cast<int32_t>(c.modes.size()));
    const auto [lo, hi] = std::minmax_element(xs.begin(), xs.end());
    for (size_t i = 0; i < c.modes.size(); ++i) {
      if (c.intervals <= 0)
        EXPECT_EQ(modes.At(static_cast<int32_t>(i)), c.modes[i]);
      else
        EXPECT_NEAR(modes.At(static_cast<int32_t>(i)), c.modes[i], CentreTolerance(*lo, *hi, c.intervals));
    }
  }
}

void CheckGeneralHistograms() {
  const Golden& g = TheGolden();
  for (const GenHistCase& c : g.genhists) {
    SCOPED_TRACE(c.set + " intervals=" + std::to_string(c.intervals.size()));
    F64 x(g.sets.at(c.set));
    tsmtest::Intervals iv(c.intervals);
    I32 counts{5};
    GenHistOutliers out{-1, -1, -1};
    int32_t err = 77;
    EXPECT_EQ(GenHistH(x.Handle(), iv.Handle(), counts.Handle(), &out, &err), 0);
    EXPECT_EQ(err, 0);
    EXPECT_EQ(counts.Values(), c.counts);
    EXPECT_EQ(out.total, c.total);
    EXPECT_EQ(out.below, c.below);
    EXPECT_EQ(out.above, c.above);
  }
}

void CheckAll() {
  CheckScalars();
  CheckHistograms();
  CheckModes();
  CheckGeneralHistograms();
}

TEST(StatsGolden, FileIsComplete) {
  const Golden& g = TheGolden();
  EXPECT_EQ(g.sets.size(), 11u);
  EXPECT_EQ(g.sets.at("n10000").size(), 10000u);
  EXPECT_GE(g.scalars.size(), 90u);
  EXPECT_GE(g.hists.size(), 10u);
  EXPECT_GE(g.modes.size(), 6u);
  EXPECT_GE(g.genhists.size(), 3u);
}

TEST(StatsGolden, EveryEntry) { CheckAll(); }

TEST(StatsArena, SameResultsFromTheWorkspace) {
  tsmtest::ScopedWorkspace ws(1u << 20);
  CheckAll();
}

TEST(StatsArena, ExhaustedWorkspaceGivesNoMemory) {
  const std::vector<double>& big = TheGolden().sets.at("u1000");
  F64 x(big), two{1.0, 3.0};
  tsmtest::ScopedWorkspace ws(256);
  const Scalar r = CallScalar([&](double* v, int32_t* e) { return Median_head(x.Handle(), v, e); });
  EXPECT_EQ(r.ret, 0);
  EXPECT_EQ(r.err, TSM_ERR_NO_MEMORY);
  EXPECT_TRUE(IsLibNaN(r.value));
  // Small requests still fit, again and again: each call gives its block back.
  for (int i = 0; i < 40; ++i) {
    const Scalar s = CallScalar([&](double* v, int32_t* e) { return Median_head(two.Handle(), v, e); });
    ASSERT_EQ(s.err, 0) << "call " << i;
    ASSERT_EQ(s.value, 2.0);
  }
}

}  // namespace
