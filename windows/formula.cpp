#include "windows/formula.h"

#include <cmath>

#include "windows/apply.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;
constexpr f64 kInvPi = 0.3183098861837907;

}  // namespace

template <class T>
ErrorCode BartHannWindow(T* x, int32 n) {
  return ApplyHalfMirroredWindow(x, n, [n](int32 i) {
    const f64 u = static_cast<f64>(i) / n - 0.5;
    return 0.62 - 0.48 * std::fabs(u) + 0.38 * std::cos(2.0 * kPi * u);
  });
}

template <class T>
ErrorCode BohmanWindow(T* x, int32 n) {
  return ApplyHalfMirroredWindow(x, n, [n](int32 i) {
    const f64 t = std::fabs(2.0 * i / n - 1.0);
    return (1.0 - t) * std::cos(kPi * t) + std::sin(kPi * t) * kInvPi;
  });
}

template <class T>
ErrorCode ParzenWindow(T* x, int32 n) {
  const f64 h = 0.5 * n;
  return ApplyHalfMirroredWindow(x, n, [h](int32 i) {
    const f64 r = std::fabs(i - h) / h;
    if (r <= 0.5) return 1.0 - 6.0 * r * r + 6.0 * r * r * r;
    const f64 q = 1.0 - r;
    return 2.0 * q * q * q;
  });
}

template <class T>
ErrorCode WelchWindow(T* x, int32 n) {
  const f64 h = 0.5 * n;
  return ApplyHalfMirroredWindow(x, n, [h](int32 i) {
    const f64 r = (i - h) / h;
    return 1.0 - r * r;
  });
}

template <class T>
ErrorCode TriangleWindow(T* x, int32 n) {
  return ApplyHalfMirroredWindow(x, n, [n](int32 i) { return 1.0 - std::fabs(2.0 * i / n - 1.0); });
}

#define TSM_WINDOW_INSTANCES(T)                 \
  template ErrorCode BartHannWindow(T*, int32); \
  template ErrorCode BohmanWindow(T*, int32);   \
  template ErrorCode ParzenWindow(T*, int32);   \
  template ErrorCode WelchWindow(T*, int32);    \
  template ErrorCode TriangleWindow(T*, int32);
TSM_WINDOW_INSTANCES(f64)
TSM_WINDOW_INSTANCES(cx)
#undef TSM_WINDOW_INSTANCES

}  // namespace tsm
