// Double-double arithmetic: a value hi + lo with |lo| <= ulp(hi)/2, about 32
// significant digits, for sums whose terms cancel by many orders of magnitude.
#pragma once

#include <cmath>

#include "frame/types.h"

namespace tsm {

struct DoubleDouble {
  f64 hi = 0, lo = 0;
};

// a + b exactly as a double-double (Knuth's two-sum).
inline DoubleDouble TwoSum(f64 a, f64 b) {
  const f64 s = a + b;
  const f64 bb = s - a;
  return {s, (a - (s - bb)) + (b - bb)};
}

// a * b exactly as a double-double (fused multiply-add for the low part).
inline DoubleDouble TwoProd(f64 a, f64 b) {
  const f64 p = a * b;
  return {p, std::fma(a, b, -p)};
}

inline DoubleDouble Normalize(f64 hi, f64 lo) {
  const f64 s = hi + lo;
  return {s, lo - (s - hi)};
}

inline DoubleDouble operator+(DoubleDouble a, DoubleDouble b) {
  const DoubleDouble s = TwoSum(a.hi, b.hi);
  const DoubleDouble t = TwoSum(a.lo, b.lo);
  const DoubleDouble u = Normalize(s.hi, s.lo + t.hi);
  return Normalize(u.hi, u.lo + t.lo);
}

inline DoubleDouble operator-(DoubleDouble a) { return {-a.hi, -a.lo}; }

inline DoubleDouble operator*(DoubleDouble a, DoubleDouble b) {
  const DoubleDouble p = TwoProd(a.hi, b.hi);
  return Normalize(p.hi, p.lo + (a.hi * b.lo + a.lo * b.hi));
}

inline DoubleDouble operator/(DoubleDouble a, DoubleDouble b) {
  const f64 q1 = a.hi / b.hi;
  const DoubleDouble r = a + -(b * DoubleDouble{q1, 0});
  const f64 q2 = r.hi / b.hi;
  const DoubleDouble r2 = r + -(b * DoubleDouble{q2, 0});
  const f64 q3 = r2.hi / b.hi;
  return Normalize(q1, q2) + DoubleDouble{q3, 0};
}

}  // namespace tsm
