// Arithmetic on the complex element type of the host blocks.
#pragma once

#include <cmath>

#include "frame/types.h"

namespace tsm {

inline cx operator+(cx a, cx b) { return cx{a.re + b.re, a.im + b.im}; }
inline cx operator-(cx a, cx b) { return cx{a.re - b.re, a.im - b.im}; }
inline cx operator*(cx a, cx b) { return cx{a.re * b.re - a.im * b.im, a.re * b.im + a.im * b.re}; }
inline cx operator*(f64 s, cx a) { return cx{s * a.re, s * a.im}; }
inline cx& operator+=(cx& a, cx b) { return a = a + b; }
inline cx Conj(cx a) { return cx{a.re, -a.im}; }
inline f64 Norm(cx a) { return a.re * a.re + a.im * a.im; }
inline cx AsCx(f64 v) { return cx{v, 0.0}; }
inline cx AsCx(cx v) { return v; }
// a / b by the reciprocal of |b|^2.
inline cx operator/(cx a, cx b) {
  const f64 q = 1.0 / Norm(b);
  return cx{(a.re * b.re + a.im * b.im) * q, (a.im * b.re - a.re * b.im) * q};
}
}  // namespace tsm
