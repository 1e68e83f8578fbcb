// Golden data files of the special-function tests (one case a line of
// whitespace-separated numbers, hex floats or decimals, '#' lines skipped) and
// a check of exact values and limits.
#pragma once

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <fstream>
#include <functional>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace tsmtest {

using GoldenRow = std::vector<double>;

// Reads TSM_TEST_DATA/<file>; an unreadable file gives no rows.
inline std::vector<GoldenRow> LoadGoldenRows(const std::string& file) {
  std::ifstream in(std::string(TSM_TEST_DATA) + "/" + file);
  std::vector<GoldenRow> rows;
  std::string line;
  while (std::getline(in, line)) {
    if (line.empty() || line[0] == '#') continue;
    std::istringstream words(line);
    GoldenRow r;
    for (std::string w; words >> w;) r.push_back(std::strtod(w.c_str(), nullptr));
    rows.push_back(r);
  }
  return rows;
}

// Runs check over every row of a golden file and expects each error at or
// below tol; returns the worst. A file of 500 rows or fewer is a fault.
inline double WorstGoldenError(const std::string& file, const std::vector<GoldenRow>& rows, double tol,
                               const std::function<double(const GoldenRow&)>& check) {
  EXPECT_GT(rows.size(), 500u) << file;
  double worst = 0;
  for (const GoldenRow& r : rows) {
    const double e = check(r);
    worst = std::fmax(worst, e);
    EXPECT_LE(e, tol) << file << " at " << r[0] << (r.size() > 1 ? ", " + std::to_string(r[1]) : "");
  }
  return worst;
}

// |got - want| relative to max(|want|, envelope), the envelope standing for
// the size of an oscillating function near its zeros; a result in the
// subnormal range counts its rounding there as one eps, and an infinite
// want must be met exactly.
inline double EnvelopeError(double got, double want, double envelope) {
  if (std::isinf(want)) return got == want ? 0 : INFINITY;
  constexpr double kEps = 2.220446049250313e-16, kTinyScale = 2.2250738585072014e-308 / kEps;
  return std::fabs(got - want) / std::fmax(std::fmax(std::fabs(want), envelope), kTinyScale);
}

// Exact values and limits: {got, want}; NaN wants NaN.
inline void ExpectCases(const std::vector<std::pair<double, double>>& cases) {
  for (size_t i = 0; i < cases.size(); ++i) {
    const auto [got, want] = cases[i];
    if (std::isnan(want)) {
      EXPECT_TRUE(std::isnan(got)) << "case " << i << " gave " << got;
    } else {
      EXPECT_EQ(got, want) << "case " << i;
    }
  }
}

}  // namespace tsmtest
