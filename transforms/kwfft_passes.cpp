// Pass family: the generated kind-0 passes of each radix, the generic odd pass
// over a root table (kind 1) and Rader's pass over a nested plan (kind 2).
#include "transforms/kwfft_passes.h"

#include <algorithm>

#include "frame/workspace.h"
#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

using std::ptrdiff_t;

constexpr int kMaxCodeletRadix = 43;

// The pass templates below take a DFT of one radix with strided input and
// output, possibly in place, as a policy: Cx for complex data, Real for real
// data into HalfComplex, each returning a code (scratch failures).

// Generic odd DFT over the root table: sums and differences of elements k
// and r-k, then each pair of bins j, r-j walks k with the root index j*k mod r.
// work holds 2r values.
struct GenericDft {
  int32 r;
  const f64* root_cos;
  const f64* root_sin;
  f64* work;

  ErrorCode Cx(const f64* ir, const f64* ii, f64* or_, f64* oi, ptrdiff_t is, ptrdiff_t os) const {
    f64* xr = work;
    f64* xi = work + r;
    for (int32 t = 0; t < r; ++t) {
      xr[t] = ir[t * is];
      xi[t] = ii[t * is];
    }
    const int32 h = r / 2;
    for (int32 k = 1; k <= h; ++k) {  // (sum, difference) in place of (k, r-k)
      const f64 ar = xr[k], ai = xi[k], br = xr[r - k], bi = xi[r - k];
      xr[k] = ar + br;
      xi[k] = ai + bi;
      xr[r - k] = ar - br;
      xi[r - k] = ai - bi;
    }
    f64 r0 = xr[0], i0 = xi[0];
    for (int32 k = 1; k <= h; ++k) {
      r0 += xr[k];
      i0 += xi[k];
    }
    for (int32 j = 1; j <= h; ++j) {
      f64 ar = xr[0], ai = xi[0], br = xr[0], bi = xi[0];
      int32 q = 0;
      for (int32 k = 1; k <= h; ++k) {
        q += j;
        if (q >= r) q -= r;
        const f64 c = root_cos[q], s = root_sin[q];
        const f64 sr = xr[k] * c, si = xi[k] * c, dr = xr[r - k] * s, di = xi[r - k] * s;
        ar += sr - di;
        br += sr + di;
        ai += si + dr;
        bi += si - dr;
      }
      or_[j * os] = ar;
      oi[j * os] = ai;
      or_[(r - j) * os] = br;
      oi[(r - j) * os] = bi;
    }
    or_[0] = r0;
    oi[0] = i0;
    return TSM_SUCCESS;
  }

  ErrorCode Real(const f64* in, f64* out, ptrdiff_t is, ptrdiff_t os) const {
    f64* x = work;
    for (int32 t = 0; t < r; ++t) x[t] = in[t * is];
    const int32 h = r / 2;
    for (int32 k = 1; k <= h; ++k) {
      const f64 a = x[k], b = x[r - k];
      x[k] = a + b;
      x[r - k] = a - b;
    }
    f64 r0 = x[0];
    for (int32 k = 1; k <= h; ++k) r0 += x[k];
    for (int32 j = 1; j <= h; ++j) {
      f64 re = x[0], im = 0;
      int32 q = 0;
      for (int32 k = 1; k <= h; ++k) {
        q += j;
        if (q >= r) q -= r;
        re += x[k] * root_cos[q];
        im += x[r - k] * root_sin[q];
      }
      out[j * os] = re;
      out[(r - j) * os] = im;
    }
    out[0] = r0;
    return TSM_SUCCESS;
  }
};

// Rader's DFT of prime length p over the nested plan of p-1: the inputs
// other than x[0], gathered by powers of the primitive root, are cyclically
// convolved with the prepared sequence through two forward transforms (the
// conjugation between them makes the second one an inverse). Bin 0 of the
// first transform is the sum of the gathered inputs, so y[0] costs one add
// rather than a serial chain over p values. work holds 6p values.
struct RaderDft {
  int32 p;
  const kwfft_stage* stage;
  f64* work;

  ErrorCode Cx(const f64* ir, const f64* ii, f64* or_, f64* oi, ptrdiff_t is, ptrdiff_t os) const {
    const int32 n1 = p - 1;
    const int32* gather = stage->rader_gather;
    const int32* scatter = stage->rader_scatter;
    f64* ur = work;
    f64* ui = work + n1;
    const f64 x0r = ir[0], x0i = ii[0];
    for (int32 i = 0; i < n1; ++i) {
      const ptrdiff_t at = gather[i + 1] * is;
      ur[i] = ir[at];
      ui[i] = ii[at];
    }
    f64* yr = or_ + os;
    f64* yi = oi + os;
    ErrorCode e = kwfft_complex(stage->rader_plan, ur, ui, yr, yi, 1, os, n1);
    if (e != TSM_SUCCESS) return e;
    const f64 sr = x0r + yr[0], si = x0i + yi[0];
    for (int32 i = 0; i < n1; ++i) {
      const f64 a = yr[i * os], b = yi[i * os], c = stage->rader_cos[i], t = stage->rader_sin[i];
      yr[i * os] = a * c - b * t;
      yi[i * os] = -(a * t + b * c);
    }
    e = kwfft_complex(stage->rader_plan, yr, yi, ur, ui, os, 1, n1);
    if (e != TSM_SUCCESS) return e;
    or_[0] = sr;
    oi[0] = si;
    for (int32 i = 1; i <= n1; ++i) {
      or_[scatter[i] * os] = ur[i - 1] + x0r;
      oi[scatter[i] * os] = x0i - ui[i - 1];
    }
    return TSM_SUCCESS;
  }

  ErrorCode Real(const f64* in, f64* out, ptrdiff_t is, ptrdiff_t os) const {
    const int32 n1 = p - 1;  // even
    const int32* gather = stage->rader_gather;
    const int32* scatter = stage->rader_scatter;
    f64* g = work;             // gathered input, then the HalfComplex spectrum
    f64* hc = work + n1;
    f64* fr = work + 2 * n1;   // full spectrum
    f64* fi = work + 3 * n1;
    f64* ur = work + 4 * n1;
    f64* ui = work + 5 * n1;
    const f64 x0 = in[0];
    for (int32 i = 0; i < n1; ++i) g[i] = in[gather[i + 1] * is];
    ErrorCode e = kwfft_real(stage->rader_plan, g, hc, 1, 1, n1);
    if (e != TSM_SUCCESS) return e;
    const f64 sum = x0 + hc[0];
    // Bins k and n1-k of the Hermitian spectrum are (a, b) and (a, -b): expand
    // and multiply by the prepared spectrum (conjugating) in one sweep.
    const f64* wc = stage->rader_cos;
    const f64* ws = stage->rader_sin;
    auto put = [&](int32 i, f64 a, f64 b) {
      fr[i] = a * wc[i] - b * ws[i];
      fi[i] = -(a * ws[i] + b * wc[i]);
    };
    put(0, hc[0], 0.0);
    for (int32 k = 1; k < n1 - k; ++k) {
      put(k, hc[k], hc[n1 - k]);
      put(n1 - k, hc[k], -hc[n1 - k]);
    }
    put(n1 / 2, hc[n1 / 2], 0.0);
    e = kwfft_complex(stage->rader_plan, fr, fi, ur, ui, 1, 1, n1);
    if (e != TSM_SUCCESS) return e;
    out[0] = sum;
    for (int32 i = 1; i <= n1; ++i) {
      const int32 q = scatter[i];
      if (2 * q > p) continue;  // the conjugate half is not stored
      out[q * os] = ur[i - 1] + x0;
      out[(p - q) * os] = -ui[i - 1];
    }
    return TSM_SUCCESS;
  }
};

template <class Dft>
ErrorCode NotwCx(const Dft& dft, int32 r, const f64* ir, const f64* ii, f64* or_, f64* oi, ptrdiff_t is,
                 ptrdiff_t os, int32 count) {
  const ptrdiff_t step = is * count;
  for (int32 i = 0; i < count; ++i) {
    const ErrorCode e = dft.Cx(ir + i * is, ii + i * is, or_ + i * r * os, oi + i * r * os, step, os);
    if (e != TSM_SUCCESS) return e;
  }
  return TSM_SUCCESS;
}

template <class Dft>
ErrorCode NotwReal(const Dft& dft, int32 r, const f64* in, f64* out, ptrdiff_t is, ptrdiff_t os, int32 count) {
  const ptrdiff_t step = is * count;
  for (int32 i = 0; i < count; ++i) {
    const ErrorCode e = dft.Real(in + i * is, out + i * r * os, step, os);
    if (e != TSM_SUCCESS) return e;
  }
  return TSM_SUCCESS;
}

// buf holds 2r values.
template <class Dft>
ErrorCode TwCx(const Dft& dft, int32 r, f64* re, f64* im, const f64* twc, const f64* tws, ptrdiff_t stride, int32 m,
               f64* buf) {
  const ptrdiff_t s = stride * m;
  ErrorCode e = dft.Cx(re, im, re, im, s, s);
  f64* br = buf;
  f64* bi = buf + r;
  for (int32 k = 1; k < m && e == TSM_SUCCESS; ++k) {
    f64* pr = re + k * stride;
    f64* pi = im + k * stride;
    const f64* wc = twc + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    const f64* ws = tws + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    br[0] = pr[0];
    bi[0] = pi[0];
    for (int32 j = 1; j < r; ++j) {
      const f64 xr = pr[j * s], xi = pi[j * s], c = wc[j], t = ws[j];
      br[j] = xr * c - xi * t;
      bi[j] = xr * t + xi * c;
    }
    e = dft.Cx(br, bi, pr, pi, 1, s);
  }
  return e;
}

// Combines r HalfComplex blocks of m into one of r*m. buf holds 4r values.
template <class Dft>
ErrorCode TwReal(const Dft& dft, int32 r, f64* data, const f64* twc, const f64* tws, ptrdiff_t stride, int32 m,
                 f64* buf) {
  const ptrdiff_t s = stride * m;
  const ptrdiff_t rm = static_cast<ptrdiff_t>(r) * m;
  ErrorCode e = dft.Real(data, data, s, s);  // the r DC values
  f64* xr = buf;
  f64* xi = buf + r;
  f64* yr = buf + 2 * r;
  f64* yi = buf + 3 * r;
  for (int32 k = 1; 2 * k < m && e == TSM_SUCCESS; ++k) {
    const f64* wc = twc + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    const f64* ws = tws + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    for (int32 j = 0; j < r; ++j) {
      const f64 a = data[(static_cast<ptrdiff_t>(j) * m + k) * stride];
      const f64 b = data[(static_cast<ptrdiff_t>(j) * m + m - k) * stride];
      if (j == 0) {
        xr[0] = a;
        xi[0] = b;
      } else {
        xr[j] = a * wc[j] - b * ws[j];
        xi[j] = a * ws[j] + b * wc[j];
      }
    }
    e = dft.Cx(xr, xi, yr, yi, 1, 1);
    for (int32 t = 0; t < r; ++t) {
      const ptrdiff_t q = k + static_cast<ptrdiff_t>(t) * m;
      if (2 * q <= rm) {
        data[q * stride] = yr[t];
        data[(rm - q) * stride] = yi[t];
      } else {
        data[(rm - q) * stride] = yr[t];
        data[q * stride] = -yi[t];
      }
    }
  }
  if (m % 2 == 0 && e == TSM_SUCCESS) {  // the middle position: real values
    const int32 k = m / 2;
    const f64* wc = twc + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    const f64* ws = tws + static_cast<ptrdiff_t>(k - 1) * (r - 1) - 1;
    xr[0] = data[k * stride];
    xi[0] = 0;
    for (int32 j = 1; j < r; ++j) {
      const f64 a = data[(static_cast<ptrdiff_t>(j) * m + k) * stride];
      xr[j] = a * wc[j];
      xi[j] = a * ws[j];
    }
    e = dft.Cx(xr, xi, yr, yi, 1, 1);
    for (int32 t = 0; t < r; ++t) {
      const ptrdiff_t q = k + static_cast<ptrdiff_t>(t) * m;
      if (2 * q < rm) {
        data[q * stride] = yr[t];
        data[(rm - q) * stride] = yi[t];
      } else if (2 * q == rm) {
        data[q * stride] = yr[t];
      }
    }
  }
  return e;
}

// ---- kind 0: the generated passes of each radix -------------------------

#define TSM_KWFFT_PASSES(r) \
  constexpr KwfftPasses kPasses##r{kwfft_real_notw_##r, kwfft_real_tw_##r, kwfft_cx_notw_##r, kwfft_cx_tw_##r};
TSM_KWFFT_CODELET_RADICES(TSM_KWFFT_PASSES)
#undef TSM_KWFFT_PASSES

struct PassTable {
  const KwfftPasses* by_radix[kMaxCodeletRadix + 1] = {};
  constexpr PassTable() {
#define TSM_KWFFT_PASS_ENTRY(r) by_radix[r] = &kPasses##r;
    TSM_KWFFT_CODELET_RADICES(TSM_KWFFT_PASS_ENTRY)
#undef TSM_KWFFT_PASS_ENTRY
  }
};
constexpr PassTable kPassTable;

// ---- kinds 1 and 2: scratch per pass --------------------------------------

// Runs fn(dft, buf) with the policy of factor `level`, its scratch, and 4r
// more values for the twiddle passes.
template <class Fn>
ErrorCode WithScratchDft(const kwfft_table& plan, int32 level, Fn fn) {
  const int32 r = plan.factors[level];
  const kwfft_stage* stage = plan.stages[level];
  Scratch<f64> work;
  if (plan.kinds[level] == kKindGeneric) {
    if (work.Allocate(6 * static_cast<std::int64_t>(r)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
    return fn(GenericDft{r, stage->root_cos, stage->root_sin, work.get()}, work.get() + 2 * r);
  }
  if (work.Allocate(10 * static_cast<std::int64_t>(r)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  return fn(RaderDft{r, stage, work.get()}, work.get() + 6 * r);
}

// When the distance of two blocks is a multiple of 4 KiB, the r values of one
// position all fall into one set of a typical L1 cache, and a twiddle pass
// walking the positions in place thrashes it. Such passes run over a few
// positions at a time copied into a contiguous buffer; the arithmetic is the
// same, so are the results.
constexpr int32 kChunk = 16;
constexpr ptrdiff_t kAliasBytes = 4096;

bool BlocksAlias(int32 r, ptrdiff_t stride, int32 m) {
  const ptrdiff_t distance = stride * m * static_cast<ptrdiff_t>(sizeof(f64));
  return r >= 8 && m > kChunk && distance % kAliasBytes == 0;
}

// The pass over positions k0 .. k0+nb-1 through the buffer. A chunk after the
// first has a dummy position 0 in front (the pass multiplies nothing there),
// so that buffer position j meets twiddle row k0+j-2, the row of its
// original position k0+j-1.
void BufferedCxTw(CxTwPass pass, int32 r, f64* re, f64* im, const f64* twc, const f64* tws, ptrdiff_t stride,
                  int32 m) {
  f64 br[kMaxCodeletRadix * (kChunk + 1)];
  f64 bi[kMaxCodeletRadix * (kChunk + 1)];
  for (int32 k0 = 0; k0 < m; k0 += kChunk) {
    const int32 nb = std::min(kChunk, m - k0);
    const int32 front = k0 == 0 ? 0 : 1;
    const int32 mb = nb + front;
    for (int32 j = 0; j < r; ++j) {
      const ptrdiff_t from = (static_cast<ptrdiff_t>(j) * m + k0) * stride;
      f64* tr = br + j * mb;
      f64* ti = bi + j * mb;
      if (front) tr[0] = ti[0] = 0.0;
      for (int32 q = 0; q < nb; ++q) {
        tr[front + q] = re[from + q * stride];
        ti[front + q] = im[from + q * stride];
      }
    }
    const ptrdiff_t row = k0 == 0 ? 0 : static_cast<ptrdiff_t>(k0 - 1) * (r - 1);
    pass(br, bi, twc + row, tws + row, 1, mb);
    for (int32 j = 0; j < r; ++j) {
      const ptrdiff_t to = (static_cast<ptrdiff_t>(j) * m + k0) * stride;
      const f64* tr = br + j * mb + front;
      const f64* ti = bi + j * mb + front;
      for (int32 q = 0; q < nb; ++q) {
        re[to + q * stride] = tr[q];
        im[to + q * stride] = ti[q];
      }
    }
  }
}

// The real twiddle pass through the buffer. Its positions pair up as k and
// m-k, so a chunk holds pairs k0 .. k0+nb-1 as positions 1..nb and their
// mirrors as mb-1 .. mb-nb of blocks of mb = 2nb+1 values; the first chunk
// brings position 0 (the DC values), the last one for even m the middle
// position (mb is then 2nb+2, its middle that of the original). Whether an
// output goes to the first or the mirrored half depends on its block only,
// so every value comes back to the position it was read from.
void BufferedRealTw(RealTwPass pass, int32 r, f64* data, const f64* twc, const f64* tws, ptrdiff_t stride, int32 m) {
  f64 buf[kMaxCodeletRadix * (2 * kChunk + 2)];
  const int32 pairs = (m - 1) / 2;
  for (int32 k0 = 1; k0 <= pairs; k0 += kChunk) {
    const int32 nb = std::min(kChunk, pairs - k0 + 1);
    const bool first = k0 == 1;
    const bool middle = k0 + nb - 1 == pairs && m % 2 == 0;
    const int32 mb = 2 * nb + 1 + (middle ? 1 : 0);
    // (buffer position, original position) of every value of a block in the chunk
    auto each = [&](auto move) {
      for (int32 j = 0; j < r; ++j) {
        f64* block = data + static_cast<ptrdiff_t>(j) * m * stride;
        f64* b = buf + j * mb;
        if (first) move(b[0], block[0]);
        for (int32 q = 1; q <= nb; ++q) {
          const ptrdiff_t k = k0 + q - 1;
          move(b[q], block[k * stride]);
          move(b[mb - q], block[(m - k) * stride]);
        }
        if (middle) move(b[mb / 2], block[static_cast<ptrdiff_t>(m / 2) * stride]);
      }
    };
    if (!first)
      for (int32 j = 0; j < r; ++j) buf[j * mb] = 0.0;
    each([](f64& b, const f64& d) { b = d; });
    const ptrdiff_t row = static_cast<ptrdiff_t>(k0 - 1) * (r - 1);
    pass(buf, twc + row, tws + row, 1, mb);
    each([](const f64& b, f64& d) { d = b; });
  }
}

}  // namespace

const KwfftPasses* KwfftPassesForRadix(int32 r) {
  return r >= 0 && r <= kMaxCodeletRadix ? kPassTable.by_radix[r] : nullptr;
}

ErrorCode KwfftCxNotw(const kwfft_table& plan, int32 level, const f64* in_re, const f64* in_im, f64* out_re,
                      f64* out_im, ptrdiff_t is, ptrdiff_t os, int32 count) {
  if (plan.kinds[level] == kKindCodelet) {
    plan.passes[level]->cx_notw(in_re, in_im, out_re, out_im, is, os, count);
    return TSM_SUCCESS;
  }
  const int32 r = plan.factors[level];
  return WithScratchDft(plan, level, [&](const auto& dft, f64*) {
    return NotwCx(dft, r, in_re, in_im, out_re, out_im, is, os, count);
  });
}

ErrorCode KwfftRealNotw(const kwfft_table& plan, int32 level, const f64* in, f64* out, ptrdiff_t is, ptrdiff_t os,
                        int32 count) {
  if (plan.kinds[level] == kKindCodelet) {
    plan.passes[level]->real_notw(in, out, is, os, count);
    return TSM_SUCCESS;
  }
  const int32 r = plan.factors[level];
  return WithScratchDft(plan, level,
                        [&](const auto& dft, f64*) { return NotwReal(dft, r, in, out, is, os, count); });
}

ErrorCode KwfftCxTw(const kwfft_table& plan, int32 level, f64* re, f64* im, ptrdiff_t stride, int32 m) {
  const kwfft_stage& st = *plan.stages[level];
  const int32 r = plan.factors[level];
  if (plan.kinds[level] == kKindCodelet) {
    if (BlocksAlias(r, stride, m))
      BufferedCxTw(plan.passes[level]->cx_tw, r, re, im, st.tw_cos, st.tw_sin, stride, m);
    else
      plan.passes[level]->cx_tw(re, im, st.tw_cos, st.tw_sin, stride, m);
    return TSM_SUCCESS;
  }
  return WithScratchDft(plan, level, [&](const auto& dft, f64* buf) {
    return TwCx(dft, r, re, im, st.tw_cos, st.tw_sin, stride, m, buf);
  });
}

ErrorCode KwfftRealTw(const kwfft_table& plan, int32 level, f64* data, ptrdiff_t stride, int32 m) {
  const kwfft_stage& st = *plan.stages[level];
  const int32 r = plan.factors[level];
  if (plan.kinds[level] == kKindCodelet) {
    if (BlocksAlias(r, stride, m))
      BufferedRealTw(plan.passes[level]->real_tw, r, data, st.tw_cos, st.tw_sin, stride, m);
    else
      plan.passes[level]->real_tw(data, st.tw_cos, st.tw_sin, stride, m);
    return TSM_SUCCESS;
  }
  return WithScratchDft(plan, level, [&](const auto& dft, f64* buf) {
    return TwReal(dft, r, data, st.tw_cos, st.tw_sin, stride, m, buf);
  });
}

}  // namespace tsm
