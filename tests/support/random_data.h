// Reproducible test data: uniform samples in [-1, 1) from a fixed seed.
#pragma once

#include <random>
#include <vector>

#include "tsmath/tsmath.h"

namespace tsmtest {

inline std::vector<double> RandomReal(int n, unsigned seed) {
  std::mt19937 rng(seed);
  std::uniform_real_distribution<double> u(-1, 1);
  std::vector<double> v(n);
  for (double& d : v) d = u(rng);
  return v;
}

inline std::vector<cx> RandomCx(int n, unsigned seed) {
  std::mt19937 rng(seed);
  std::uniform_real_distribution<double> u(-1, 1);
  std::vector<cx> v(n);
  for (cx& z : v) z = cx{u(rng), u(rng)};
  return v;
}

}  // namespace tsmtest
