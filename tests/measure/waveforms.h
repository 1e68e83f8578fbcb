// Waveforms with known measurements for the pulse tests: a periodic trapezoid
// in continuous time, whose crossing instants are closed forms, sampled at
// t0 + i dt with optional uniform noise.
#pragma once

#include <vector>

namespace tsmtest {

struct Trapezoid {
  double low, high;
  double delay;                    // start of the first rise
  double rise, top, fall, period;  // ramp durations, high plateau, period

  double operator()(double t) const;
  // Instant at which rise k (from 0) or fall k passes level v.
  double RiseAt(int k, double v) const { return delay + k * period + (v - low) / (high - low) * rise; }
  double FallAt(int k, double v) const {
    return delay + k * period + rise + top + (high - v) / (high - low) * fall;
  }
  std::vector<double> Sample(double t0, double dt, int n, double noise = 0, unsigned seed = 1) const;
};

// Mean of x[from, to) in long double.
double LongMean(const std::vector<double>& x, int from, int to);
// Sum of squares of x[from, to) in long double.
double LongSumSquares(const std::vector<double>& x, int from, int to);

}  // namespace tsmtest
