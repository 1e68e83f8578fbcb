// The cosines are not evaluated per sample. For each coefficient a rotation
// by theta_k = 2 pi k / n is stepped in the form
//   c' = c - (alpha c + beta s),  s' = s - (alpha s - beta c),
// alpha = 2 sin^2(theta_k / 2), beta = sin(theta_k), which keeps the update
// small against c and s and so loses little to rounding; the states start
// scaled by the signed coefficient, so a sample's window value is the sum of
// the c's. One sine pair per coefficient, m multiply-adds per sample pair.
// Sample i and n-i share a value; the middle of an even length is sum a[k]
// exactly, since cos(pi k) = (-1)^k.
#include "windows/cosine_sum.h"

#include <cmath>

#include "frame/workspace.h"
#include "windows/apply.h"
#include "windows/selector.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;

struct Rotation {
  f64 c, s, alpha, beta;
};

}  // namespace

template <class T>
ErrorCode CosineSumWindow(T* x, int32 n, const f64* a, int32 m, bool normalise) {
  if (n < 1 || m < 1) return TSM_ERR_EMPTY;
  if (n == 1 || (m == 1 && a[0] == 1.0)) return TSM_SUCCESS;
  Scratch<Rotation> rot;
  if (rot.Allocate(m) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  const f64 a0 = a[0];
  f64 first = 0, middle = 0;
  for (int32 k = 0; k < m; ++k) {
    const f64 coef = normalise ? a[k] / a0 : a[k];
    const f64 signed_coef = (k % 2 != 0) ? -coef : coef;
    const f64 half = kPi * k / n;
    const f64 sh = std::sin(half);
    rot[k] = Rotation{signed_coef, 0.0, 2.0 * sh * sh, std::sin(2.0 * half)};
    first += signed_coef;
    middle += coef;
  }
  ScaleSample(x[0], first);
  for (int32 i = 1; i <= (n - 1) / 2; ++i) {
    f64 w = 0;
    for (int32 k = 0; k < m; ++k) {
      Rotation& r = rot[k];
      const f64 c = r.c - (r.alpha * r.c + r.beta * r.s);
      r.s -= r.alpha * r.s - r.beta * r.c;
      r.c = c;
      w += c;
    }
    ScaleSample(x[i], w);
    ScaleSample(x[n - i], w);
  }
  if (n % 2 == 0) ScaleSample(x[n / 2], middle);
  return TSM_SUCCESS;
}

template <class T>
ErrorCode SelectorCosineWindow(T* x, int32 n, int32 selector, bool normalise) {
  const CosineCoefficients coefs = CosineSumCoefficients(selector);
  if (coefs.a == nullptr) return TSM_ERR_BAD_SELECTOR;
  return CosineSumWindow(x, n, coefs.a, coefs.m, normalise);
}

template ErrorCode CosineSumWindow(f64*, int32, const f64*, int32, bool);
template ErrorCode CosineSumWindow(cx*, int32, const f64*, int32, bool);
template ErrorCode SelectorCosineWindow(f64*, int32, int32, bool);
template ErrorCode SelectorCosineWindow(cx*, int32, int32, bool);

}  // namespace tsm
