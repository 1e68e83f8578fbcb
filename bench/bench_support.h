// Helpers shared by the benchmark programs.
#pragma once

#include <random>
#include <vector>

namespace bench {

// n values uniform in [-1, 1) from a fixed seed.
inline std::vector<double> Noise(size_t n, unsigned seed) {
  std::mt19937_64 rng(seed);
  std::uniform_real_distribution<double> u(-1, 1);
  std::vector<double> v(n);
  for (double& x : v) x = u(rng);
  return v;
}

}  // namespace bench
