// The recursive decimation-in-time driver and the inverses built from the
// forward transforms. The smallest radix is at the top of the recursion and
// the largest at the leaves; the input is read in decimated order and
// nothing is bit-reversed or copied.
#include <utility>

#include "transforms/kwfft.h"
#include "transforms/kwfft_passes.h"

namespace tsm {
namespace {

using std::ptrdiff_t;

ErrorCode CxLevel(const kwfft_table& p, int32 length, int32 level, const f64* ir, const f64* ii, f64* or_, f64* oi,
                  ptrdiff_t is, ptrdiff_t os) {
  const int32 r = p.factors[level];
  const int32 m = length / r;
  ErrorCode e = TSM_SUCCESS;
  if (level == p.factor_count - 2) {
    e = KwfftCxNotw(p, level + 1, ir, ii, or_, oi, is, os, r);
  } else {
    for (int32 i = 0; i < r && e == TSM_SUCCESS; ++i) {
      const ptrdiff_t o = static_cast<ptrdiff_t>(i) * m * os;
      e = CxLevel(p, m, level + 1, ir + i * is, ii + i * is, or_ + o, oi + o, r * is, os);
    }
  }
  if (e != TSM_SUCCESS) return e;
  return KwfftCxTw(p, level, or_, oi, os, m);
}

ErrorCode RealLevel(const kwfft_table& p, int32 length, int32 level, const f64* in, f64* out, ptrdiff_t is,
                    ptrdiff_t os) {
  const int32 r = p.factors[level];
  const int32 m = length / r;
  ErrorCode e = TSM_SUCCESS;
  if (level == p.factor_count - 2) {
    e = KwfftRealNotw(p, level + 1, in, out, is, os, r);
  } else {
    for (int32 i = 0; i < r && e == TSM_SUCCESS; ++i)
      e = RealLevel(p, m, level + 1, in + i * is, out + static_cast<ptrdiff_t>(i) * m * os, r * is, os);
  }
  if (e != TSM_SUCCESS) return e;
  return KwfftRealTw(p, level, out, os, m);
}

// (a, b) -> (a - b, a + b) over the pairs k, n-k: HalfComplex to Hartley and back.
void HartleyPairs(f64* x, ptrdiff_t stride, int32 n) {
  for (int32 k = 1; k < (n + 1) / 2; ++k) {
    const f64 a = x[k * stride], b = x[(n - k) * stride];
    x[k * stride] = a - b;
    x[(n - k) * stride] = a + b;
  }
}

}  // namespace

ErrorCode kwfft_complex(const kwfft_table* plan, const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        ptrdiff_t in_stride, ptrdiff_t out_stride, int32 n) {
  if (plan->n != n) return -1;
  if (n == 1) {
    out_re[0] = in_re[0];
    out_im[0] = in_im[0];
    return TSM_SUCCESS;
  }
  if (plan->factor_count == 1) return KwfftCxNotw(*plan, 0, in_re, in_im, out_re, out_im, in_stride, out_stride, 1);
  return CxLevel(*plan, n, 0, in_re, in_im, out_re, out_im, in_stride, out_stride);
}

ErrorCode kwfft_complex_inverse(const kwfft_table* plan, const f64* in_re, const f64* in_im, f64* out_re,
                                f64* out_im, ptrdiff_t in_stride, ptrdiff_t out_stride, int32 n) {
  const ErrorCode e = kwfft_complex(plan, in_re, in_im, out_re, out_im, in_stride, out_stride, n);
  if (e != TSM_SUCCESS) return e;
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {
    std::swap(out_re[k * out_stride], out_re[(n - k) * out_stride]);
    std::swap(out_im[k * out_stride], out_im[(n - k) * out_stride]);
  }
  const f64 scale = 1.0 / n;
  for (int32 k = 0; k < n; ++k) {
    out_re[k * out_stride] *= scale;
    out_im[k * out_stride] *= scale;
  }
  return TSM_SUCCESS;
}

ErrorCode kwfft_real(const kwfft_table* plan, const f64* in, f64* out, ptrdiff_t in_stride, ptrdiff_t out_stride,
                     int32 n) {
  if (plan->n != n) return TSM_ERR_INTERNAL;
  if (n == 1) {
    out[0] = in[0];
    return TSM_SUCCESS;
  }
  if (plan->factor_count == 1) return KwfftRealNotw(*plan, 0, in, out, in_stride, out_stride, 1);
  return RealLevel(*plan, n, 0, in, out, in_stride, out_stride);
}

ErrorCode kwfft_real_inverse(const kwfft_table* plan, f64* in, f64* out, ptrdiff_t in_stride, ptrdiff_t out_stride,
                             int32 n) {
  if (plan->n != n) return TSM_ERR_INTERNAL;
  const f64 scale = 1.0 / n;
  for (int32 k = 0; k < n; ++k) in[k * in_stride] *= scale;
  HartleyPairs(in, in_stride, n);
  const ErrorCode e = kwfft_real(plan, in, out, in_stride, out_stride, n);
  if (e != TSM_SUCCESS) return e;
  HartleyPairs(out, out_stride, n);
  return TSM_SUCCESS;
}

}  // namespace tsm
