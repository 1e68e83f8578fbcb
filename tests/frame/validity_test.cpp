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

// The value at the end of a misaligned run of harmless data.
template <class Fn>
int ScanMisaligned(Fn scan, const std::vector<double>& data) {
  std::vector<unsigned char> raw(4 + data.size() * sizeof(double));
  std::memcpy(raw.data() + 4, data.data(), data.size() * sizeof(double));
  return scan(raw.data() + 4, static_cast<int>(data.size()));
}

TEST(Validity, RealScanBounds) {
  for (const Value& c : kValues) {
    std::vector<double> data(7, 1.5);
    data.back() = c.v;
    const int got = ScanMisaligned(
        [](unsigned char* p, int n) { return tsm::HasNonFiniteValue(reinterpret_cast<double*>(p), n); }, data);
    EXPECT_EQ(got, c.refused) << c.v;
  }
}

TEST(Validity, ComplexScanLooksAtBothParts) {
  for (const Value& c : kValues) {
    for (int part = 0; part < 2; ++part) {
      std::vector<double> data(8, -2.5);
      data[6 + part] = c.v;  // the last element's real or imaginary part
      const int got = ScanMisaligned(
          [](unsigned char* p, int n) { return tsm::CxHasNonFiniteValue(reinterpret_cast<tsm::cx*>(p), n / 2); },
          data);
      EXPECT_EQ(got, c.refused) << c.v << " part " << part;
    }
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
