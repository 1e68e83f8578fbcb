#include "transforms/dct.h"

#include <algorithm>
#include <climits>
#include <cmath>
#include <cstddef>

#include "frame/heap.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;
constexpr f64 kSqrt2 = 1.4142135623730951;

bool IsCosine(TrigKind kind) { return kind == TrigKind::kDct || kind == TrigKind::kInverseDct; }

// The FFT's input and output, each of the plan's length.
std::int64_t WorkValues(TrigKind kind, int32 n) { return 2 * TrigPlanLength(kind, n); }
// cos and sin of pi k / (2n), k < n, for the cosine transforms.
std::int64_t TableValues(TrigKind kind, int32 n) { return IsCosine(kind) ? 2 * static_cast<std::int64_t>(n) : 0; }

// The table up to pi/4 as exp(i a (j + m)) = exp(i a j) exp(i a m), j a
// multiple of b ~ sqrt(n/2) and m below b, from 2b directly evaluated values
// (a product adds about 2 eps); above pi/4 by reflection, cos(pi/2 - x) =
// sin(x), so that no angle near pi/2 is ever rounded.
void FillQuarterTurn(int32 n, f64* c, f64* s) {
  const f64 a = kPi / (2.0 * n);
  const int32 half = n / 2;
  const int32 b = static_cast<int32>(std::sqrt(half + 1.0));
  for (int32 m = 0; m < b && m <= half; ++m) {
    c[m] = std::cos(a * m);
    s[m] = std::sin(a * m);
  }
  for (int32 j = b; j <= half; j += b) {
    const f64 cj = std::cos(a * j), sj = std::sin(a * j);
    for (int32 m = 0; m < b && j + m <= half; ++m) {
      c[j + m] = cj * c[m] - sj * s[m];
      s[j + m] = sj * c[m] + cj * s[m];
    }
  }
  for (int32 k = half + 1; k < n; ++k) {
    c[k] = s[n - k];
    s[k] = c[n - k];
  }
}

// A strided run of values; reads beyond `count` give zeros.
struct Strided {
  const f64* p;
  std::ptrdiff_t stride;
  int32 count;
  f64 operator()(int32 i) const { return i < count ? p[i * stride] : 0.0; }
};

// One transform length of a call: its plan, its table, and the work buffer
// that all lengths of the call share.
struct Line {
  TrigKind kind;
  const kwfft_table* plan;
  int32 n;
  const f64* c = nullptr;
  const f64* s = nullptr;
  f64* work = nullptr;

  // Every input value is gathered before the first output is written, so
  // `in` and `out` may overlap.
  ErrorCode Run(const Strided& in, f64* out, std::ptrdiff_t outStride) const {
    auto y = [&](int32 k) -> f64& { return out[k * outStride]; };
    switch (kind) {
      case TrigKind::kDct: return ForwardCosine(in, y);
      case TrigKind::kInverseDct: return InverseCosine(in, y);
      default: return Sine(in, y);
    }
  }

  // y[k] = Re(exp(-i pi k / (2n)) V[k]) times 2/sqrt(2n) (even route, V of
  // the reordered input) or 1/sqrt(2n) (odd route, V of the mirrored input),
  // and y[0] over sqrt(2) besides.
  template <class Out>
  ErrorCode ForwardCosine(const Strided& x, Out y) const {
    const int32 L = static_cast<int32>(TrigPlanLength(kind, n));
    f64 *v = work, *h = work + L;
    if (n % 2 == 0) {
      for (int32 i = 0; i < n / 2; ++i) {
        v[i] = x(2 * i);
        v[n - 1 - i] = x(2 * i + 1);
      }
    } else {
      for (int32 i = 0; i < n; ++i) v[i] = v[L - 1 - i] = x(i);
    }
    if (const ErrorCode e = kwfft_real(plan, v, h, 1, 1, L); e != TSM_SUCCESS) return e;
    const f64 scale = (n % 2 == 0 ? 2.0 : 1.0) / std::sqrt(2.0 * n);
    y(0) = h[0] * scale / kSqrt2;
    if (n % 2 == 0) {
      // Bins above n/2 are conjugates of those below: both come from one pair.
      for (int32 k = 1; k < n / 2; ++k) {
        const f64 re = h[k], im = h[n - k];
        y(k) = (c[k] * re + s[k] * im) * scale;
        y(n - k) = (s[k] * re - c[k] * im) * scale;
      }
      y(n / 2) = c[n / 2] * h[n / 2] * scale;
    } else {
      for (int32 k = 1; k < n; ++k) y(k) = (c[k] * h[k] + s[k] * h[L - k]) * scale;
    }
    return TSM_SUCCESS;
  }

  // The spectrum V that the forward route transformed, rebuilt from y and
  // taken back by the real inverse: V[k] = sqrt(n/2) exp(i pi k/(2n))
  // (y[k] - i y[n-k]) and V[0] = sqrt(n) y[0] for even n, then the reordering
  // undone; V[k] = sqrt(2n) exp(i pi k/(2n)) y[k], V[0] = 2 sqrt(n) y[0] and
  // V[n] = 0 for odd n, of which the first half is the result.
  template <class Out>
  ErrorCode InverseCosine(const Strided& y, Out x) const {
    const int32 L = static_cast<int32>(TrigPlanLength(kind, n));
    f64 *h = work, *v = work + L;
    const f64 rootN = std::sqrt(static_cast<f64>(n));
    if (n % 2 == 0) {
      const f64 a = std::sqrt(n / 2.0);
      h[0] = rootN * y(0);
      for (int32 k = 1; k < n / 2; ++k) {
        const f64 p = y(k), q = y(n - k);
        h[k] = a * (c[k] * p + s[k] * q);
        h[n - k] = a * (s[k] * p - c[k] * q);
      }
      h[n / 2] = rootN * y(n / 2);
    } else {
      const f64 b = std::sqrt(2.0 * n);
      h[0] = 2.0 * rootN * y(0);
      for (int32 k = 1; k < n; ++k) {
        h[k] = b * y(k) * c[k];
        h[L - k] = b * y(k) * s[k];
      }
      h[n] = 0.0;
    }
    if (const ErrorCode e = kwfft_real_inverse(plan, h, v, 1, 1, L); e != TSM_SUCCESS) return e;
    if (n % 2 == 0) {
      for (int32 i = 0; i < n / 2; ++i) {
        x(2 * i) = v[i];
        x(2 * i + 1) = v[n - 1 - i];
      }
    } else {
      for (int32 t = 0; t < n; ++t) x(t) = v[t];
    }
    return TSM_SUCCESS;
  }

  // Bins 1..n of the odd extension e = (0, x, 0, -reversed x) have imaginary
  // parts -2 sum x[t] sin(pi (t+1) k / (n+1)).
  template <class Out>
  ErrorCode Sine(const Strided& x, Out y) const {
    const int32 L = static_cast<int32>(TrigPlanLength(kind, n));
    f64 *e = work, *h = work + L;
    e[0] = 0.0;
    e[n + 1] = 0.0;
    for (int32 i = 0; i < n; ++i) {
      e[i + 1] = x(i);
      e[L - 1 - i] = -x(i);
    }
    if (const ErrorCode r = kwfft_real(plan, e, h, 1, 1, L); r != TSM_SUCCESS) return r;
    if (kind == TrigKind::kDst) {
      for (int32 k = 1; k <= n; ++k) y(k - 1) = -0.5 * h[L - k];
    } else {
      const f64 np1 = n + 1.0;
      for (int32 k = 1; k <= n; ++k) y(k - 1) = -h[L - k] / np1;
    }
    return TSM_SUCCESS;
  }
};

// One heap block for the call: a table per line, then the work buffer sized
// for the largest demand among them.
ErrorCode PrepareLines(HeapScratch<f64>& block, Line* lines, int count) {
  std::int64_t tables = 0, work = 0;
  for (int i = 0; i < count; ++i) {
    if (lines[i].n < 1) return IsCosine(lines[i].kind) ? TSM_ERR_EMPTY : TSM_ERR_TRANSFORM_SIZE;
    if (TrigPlanLength(lines[i].kind, lines[i].n) > INT32_MAX) return TSM_ERR_NO_MEMORY;
    tables += TableValues(lines[i].kind, lines[i].n);
    work = std::max(work, WorkValues(lines[i].kind, lines[i].n));
  }
  if (!block.Allocate(tables + work)) return TSM_ERR_NO_MEMORY;
  f64* p = block.get();
  for (int i = 0; i < count; ++i) {
    Line& line = lines[i];
    if (IsCosine(line.kind)) {
      f64* c = p;
      f64* s = p + line.n;
      FillQuarterTurn(line.n, c, s);
      line.c = c;
      line.s = s;
      p += 2 * static_cast<std::ptrdiff_t>(line.n);
    }
  }
  for (int i = 0; i < count; ++i) lines[i].work = p;
  return TSM_SUCCESS;
}

}  // namespace

std::int64_t TrigPlanLength(TrigKind kind, int32 n) {
  const std::int64_t m = n;
  if (IsCosine(kind)) return m % 2 == 0 ? m : 2 * m;
  return 2 * m + 2;
}

ErrorCode TrigTransform(TrigKind kind, const kwfft_table* plan, const f64* x, int32 count, f64* y, int32 n) {
  HeapScratch<f64> block;
  Line line{kind, plan, n};
  if (const ErrorCode e = PrepareLines(block, &line, 1); e != TSM_SUCCESS) return e;
  return line.Run(Strided{x, 1, count}, y, 1);
}

ErrorCode TrigTransform2D(TrigKind kind, const kwfft_table* planRows, const kwfft_table* planCols, const f64* x,
                          int32 xRows, int32 xCols, f64* y, int32 rows, int32 cols) {
  HeapScratch<f64> block;
  Line lines[2] = {{kind, planCols, cols}, {kind, planRows, rows}};
  if (const ErrorCode e = PrepareLines(block, lines, 2); e != TSM_SUCCESS) return e;
  const int32 width = std::min(xCols, cols);
  for (int32 r = 0; r < rows; ++r) {
    const Strided row{x + static_cast<std::ptrdiff_t>(r < xRows ? r : 0) * xCols, 1, r < xRows ? width : 0};
    if (const ErrorCode e = lines[0].Run(row, y + static_cast<std::ptrdiff_t>(r) * cols, 1); e != TSM_SUCCESS)
      return e;
  }
  for (int32 col = 0; col < cols; ++col) {
    if (const ErrorCode e = lines[1].Run(Strided{y + col, cols, rows}, y + col, cols); e != TSM_SUCCESS) return e;
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
