#include "transforms/zoom.h"

#include <algorithm>
#include <cmath>

#include "frame/cx_ops.h"
#include "frame/heap.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

// s[j] = x[r + j a], zero past the input.
template <class T>
void Gather(const T* x, int32 n, int32 r, int32 a, int32 m, T* s) {
  for (int32 j = 0; j < m; ++j) {
    const std::int64_t t = r + static_cast<std::int64_t>(j) * a;
    s[j] = t < n ? x[t] : T{};
  }
}

// Phase r's length-m spectrum S_r, read at bin j.
struct RealPhase {
  const kwfft_table* plan;
  int32 m;
  HeapScratch<f64> s, h;
  bool Allocate() { return s.Allocate(m) && h.Allocate(m); }
  ErrorCode Transform(const f64* x, int32 n, int32 r, int32 a) {
    Gather(x, n, r, a, m, s.get());
    return kwfft_real(plan, s.get(), h.get(), 1, 1, m);
  }
  // Bins 0 and m/2 are real; above m/2 the conjugate of the mirror bin.
  cx Bin(int32 j) const {
    if (j == 0 || 2 * j == m) return cx{h[j], 0.0};
    return 2 * j < m ? cx{h[j], h[m - j]} : cx{h[m - j], -h[j]};
  }
};

struct ComplexPhase {
  const kwfft_table* plan;
  int32 m;
  HeapScratch<cx> s, S;
  bool Allocate() { return s.Allocate(m) && S.Allocate(m); }
  ErrorCode Transform(const cx* x, int32 n, int32 r, int32 a) {
    Gather(x, n, r, a, m, s.get());
    return kwfft_complex(plan, &s[0].re, &s[0].im, &S[0].re, &S[0].im, 2, 2, m);
  }
  cx Bin(int32 j) const { return S[j]; }
};

template <class T, class Phase>
ErrorCode Zoom(const kwfft_table* plan, T* x, int32 n, int32 a, int32 m, int32 k, int32 Q, cx* X) {
  if (plan == nullptr || plan->n != m) return TSM_ERR_INTERNAL;
  const std::int64_t P = static_cast<std::int64_t>(a) * m;
  if (P > 0x7FFFFFFF) return TSM_ERR_NEGATIVE_TRANSFORM_SIZE;
  for (std::int64_t start = m; n > P && start < n; start += P) {
    const std::int64_t len = std::min<std::int64_t>(P, n - start);
    for (std::int64_t j = 0; j < len; ++j) x[j] += x[start + j];
  }
  Phase phase{plan, m, {}, {}};
  if (!phase.Allocate()) return TSM_ERR_NO_MEMORY;
  std::fill(X, X + Q, cx{0.0, 0.0});
  const int32 km = k >= 0 ? k % m : m - (-static_cast<std::int64_t>(k)) % m;
  const f64 w = kKwfftTwoPi / static_cast<f64>(P);
  for (int32 r = 0; r < a; ++r) {
    if (const ErrorCode e = phase.Transform(x, n, r, a); e != TSM_SUCCESS) return e;
    // exp(-2 pi i r (k + q) / P), walked in q from its value at q = 0.
    const std::int64_t rk = (static_cast<std::int64_t>(r) * k) % P;
    const cx step{std::cos(w * r), -std::sin(w * r)};
    cx rot{std::cos(w * static_cast<f64>(rk)), -std::sin(w * static_cast<f64>(rk))};
    int32 j = km % m;
    for (int32 q = 0; q < Q; ++q) {
      X[q] += phase.Bin(j) * rot;
      rot = rot * step;
      if (++j == m) j = 0;
    }
  }
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode ReZoomTransform(const kwfft_table* plan, f64* x, int32 n, int32 a, int32 m, int32 k, int32 Q, cx* X) {
  return Zoom<f64, RealPhase>(plan, x, n, a, m, k, Q, X);
}
ErrorCode CxZoomTransform(const kwfft_table* plan, cx* x, int32 n, int32 a, int32 m, int32 k, int32 Q, cx* X) {
  return Zoom<cx, ComplexPhase>(plan, x, n, a, m, k, Q, X);
}

}  // namespace tsm
