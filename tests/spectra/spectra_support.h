// Shared by the spectra and DCT tests: a fixture that ends the host run and
// finds every block given back, random data, and an error measure.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <random>
#include <vector>

#include "support/host_arrays.h"
#include "support/reference_dft.h"

namespace tsmtest {

class TransformEntries : public ::testing::Test {
 protected:
  void SetUp() override { blocks_ = tsrt_live_blocks(); }
  void TearDown() override {
    tsrt_end_run();  // releases every plain state
    EXPECT_EQ(tsrt_live_blocks(), blocks_);
  }
  int64_t blocks_ = 0;
};

// Both kinds of state for one entry and its twin; the host releases the
// reserved one, the end of the run the plain one.
struct States {
  PlanHolder* plain = nullptr;
  ReservedTransformState* reserved = nullptr;
  ~States() { TransformUnreserveProc(&reserved); }
};

inline std::vector<double> RandomReal(int n, unsigned seed) {
  std::mt19937 rng(seed);
  std::uniform_real_distribution<double> u(-1, 1);
  std::vector<double> v(n);
  for (double& x : v) x = u(rng);
  return v;
}

// The acceptance bound: every value within 1e3 eps of the data's scale.
inline constexpr double kBound = 1e3 * kEps;

// Largest |got - want| over the data's scale, the largest |want| (or
// `fallback` where the reference is all zeros).
inline double ScaledError(const std::vector<CxL>& got, const std::vector<CxL>& want, long double fallback = 1) {
  EXPECT_EQ(got.size(), want.size());
  if (got.size() != want.size()) return 1;
  long double err = 0, scale = 0;
  for (size_t k = 0; k < want.size(); ++k) {
    err = std::max(err, std::abs(got[k] - want[k]));
    scale = std::max(scale, std::abs(want[k]));
  }
  return static_cast<double>(err / (scale > 0 ? scale : fallback));
}

}  // namespace tsmtest
