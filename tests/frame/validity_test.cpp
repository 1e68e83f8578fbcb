// The scans for values the fits and matrix kernels refuse.
#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <vector>

#include "frame/validity.h"

namespace tsmtest {
namespace {

constexpr double kInf = std::numeric_limits<double>::infinity();
constexpr double kMax = 1.7976931348623157e308;
constexpr double kNegBound = -1.7976931348623e308;

struct Value {
  double v;
  int refused;
};
// The positive bound is the largest float64 itself; the negative one is a
// 14-digit bound taken as a range.
const Value kValues[] = {
    {0.0, 0},
    {-0.0, 0},
    {1e-310, 0},
    {NAN, 1},
    {kInf, 1},
    {-kInf, 1},
    {kMax, 1},
    {std::nextafter(kMax, 0.0), 0},  // 1.7976931348623155e308
    {-kMax, 1},
    {kNegBound, 1},
    {std::nextafter(kNegBound, 0.0), 0},
    {-1.7976931348622e308, 0},
};

// Each value at the end of a misaligned run of harmless data, and in either
// part of the last element of a complex run.
TEST(Validity, ScansRefuseTheValuesOutOfBounds) {
  std::vector<unsigned char> raw(4 + 8 * sizeof(double));
  const auto put = [&](int i, double v) { std::memcpy(raw.data() + 4 + i * sizeof(double), &v, sizeof v); };
  const auto* re = reinterpret_cast<const double*>(raw.data() + 4);
  const auto* z = reinterpret_cast<const tsm::cx*>(raw.data() + 4);
  for (const Value& c : kValues) {
    for (int i = 0; i < 8; ++i) put(i, 1.5);
    put(6, c.v);
    EXPECT_EQ(tsm::HasNonFiniteValue(re, 7), c.refused) << c.v;
    EXPECT_EQ(tsm::CxHasNonFiniteValue(z, 4), c.refused) << c.v << " real part";
    put(6, 1.5);
    put(7, c.v);
    EXPECT_EQ(tsm::CxHasNonFiniteValue(z, 4), c.refused) << c.v << " imaginary part";
  }
}

TEST(Validity, EmptyAndNegativeCountsFindNothing) {
  const double nan = NAN;
  const tsm::cx z{NAN, NAN};
  for (int n : {0, -1, -1000}) {
    EXPECT_EQ(tsm::HasNonFiniteValue(&nan, n), 0);
    EXPECT_EQ(tsm::CxHasNonFiniteValue(&z, n), 0);
  }
}

}  // namespace
}  // namespace tsmtest
