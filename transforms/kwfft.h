// The four transforms over a plan. Strides count float64 elements; split
// complex data is passed as two pointers with stride 1, interleaved data as
// (base, base + 1) with stride 2. Forward transforms are unscaled with sign
// exp(-2 pi i k t / n); inverses scale by 1/n. Input and output must not
// overlap. n must equal the plan's length.
#pragma once

#include <cstddef>

#include "frame/types.h"
#include "transforms/kwfft_plan.h"

namespace tsm {

// -1 when n is not the plan's length.
ErrorCode kwfft_complex(const kwfft_table* plan, const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        std::ptrdiff_t in_stride, std::ptrdiff_t out_stride, int32 n);
ErrorCode kwfft_complex_inverse(const kwfft_table* plan, const f64* in_re, const f64* in_im, f64* out_re,
                                f64* out_im, std::ptrdiff_t in_stride, std::ptrdiff_t out_stride, int32 n);

// Real input to HalfComplex output: out[0] = Re X[0]; out[k] = Re X[k] and
// out[n-k] = Im X[k] for 1 <= k <= (n-1)/2; out[n/2] = Re X[n/2] for even n.
// -20999 when n is not the plan's length.
ErrorCode kwfft_real(const kwfft_table* plan, const f64* in, f64* out, std::ptrdiff_t in_stride,
                     std::ptrdiff_t out_stride, int32 n);
// HalfComplex input (overwritten) to real output. -20999 on a length mismatch.
ErrorCode kwfft_real_inverse(const kwfft_table* plan, f64* in, f64* out, std::ptrdiff_t in_stride,
                             std::ptrdiff_t out_stride, int32 n);

// cx holds n complex values whose real slots hold a HalfComplex spectrum (as
// kwfft_real leaves it with out_stride 2); rewrites it into the full spectrum.
// shift non-zero puts bin 0 at index n/2, bin k at n/2 + k, negative bins below.
void kwfft_unpack_halfcomplex(cx* spectrum, int32 n, int32 shift);
// The reverse, reading only the non-negative bins of a Hermitian spectrum.
void kwfft_pack_halfcomplex(const cx* spectrum, int32 n, int32 shift, f64* hc);

}  // namespace tsm
