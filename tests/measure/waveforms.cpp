#include "waveforms.h"

#include <cmath>
#include <random>

namespace tsmtest {

double Trapezoid::operator()(double t) const {
  double u = std::fmod(t - delay, period);
  if (u < 0) u += period;
  const double span = high - low;
  if (u < rise) return low + span * u / rise;
  if (u < rise + top) return high;
  if (u < rise + top + fall) return high - span * (u - rise - top) / fall;
  return low;
}

std::vector<double> Trapezoid::Sample(double t0, double dt, int n, double noise, unsigned seed) const {
  std::mt19937_64 gen(seed);
  std::uniform_real_distribution<double> u(-noise, noise);
  std::vector<double> x(n);
  for (int i = 0; i < n; ++i) x[i] = (*this)(t0 + i * dt) + (noise > 0 ? u(gen) : 0.0);
  return x;
}

double LongMean(const std::vector<double>& x, int from, int to) {
  long double s = 0;
  for (int i = from; i < to; ++i) s += x[i];
  return static_cast<double>(s / (to - from));
}

double LongSumSquares(const std::vector<double>& x, int from, int to) {
  long double s = 0;
  for (int i = from; i < to; ++i) s += static_cast<long double>(x[i]) * x[i];
  return static_cast<double>(s);
}

}  // namespace tsmtest
