// The pass family of the FFT engine. A pass runs one radix over a whole
// level of the recursion:
//   notw (leaf): for i < count, the DFT of the r inputs at in + i*is with
//     stride is*count, into out + i*r*os at stride os;
//   tw (twiddle): in place over r blocks of m positions at `stride` (block j
//     at j*m*stride): position k of block j is multiplied by the twiddle of
//     row k, then the r values of each position go through the DFT.
// The real passes take real input and leave HalfComplex blocks; the real
// twiddle pass combines r HalfComplex blocks of m into one of r*m.
#pragma once

#include <cstddef>

#include "transforms/kwfft_codelets.h"
#include "transforms/kwfft_plan.h"

namespace tsm {

using CxNotwPass = void (*)(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                            std::ptrdiff_t os, int32 count);
using RealNotwPass = void (*)(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
using CxTwPass = void (*)(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
using RealTwPass = void (*)(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

struct KwfftPasses {
  RealNotwPass real_notw;
  RealTwPass real_tw;
  CxNotwPass cx_notw;
  CxTwPass cx_tw;
};

// The passes of a radix of the list; null for any other value.
const KwfftPasses* KwfftPassesForRadix(int32 r);

// Passes of the other kinds, for factor `level` of a plan. They take scratch
// from the allocator front and return its failure.
ErrorCode KwfftCxNotw(const kwfft_table& plan, int32 level, const f64* in_re, const f64* in_im, f64* out_re,
                      f64* out_im, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
ErrorCode KwfftRealNotw(const kwfft_table& plan, int32 level, const f64* in, f64* out, std::ptrdiff_t is,
                        std::ptrdiff_t os, int32 count);
ErrorCode KwfftCxTw(const kwfft_table& plan, int32 level, f64* re, f64* im, std::ptrdiff_t stride, int32 m);
ErrorCode KwfftRealTw(const kwfft_table& plan, int32 level, f64* data, std::ptrdiff_t stride, int32 m);

}  // namespace tsm
