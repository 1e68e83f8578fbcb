// Zoom transform: Q consecutive bins, from bin k, of the DFT of length
// P = a m of x, through a transforms of length m (one per decimation phase):
//   X[q] = sum_t x[t] exp(-2 pi i t (k + q) / P).
// An input longer than P is folded onto its first P values in place, in
// blocks of P starting at index m. Scratch comes from the C heap.
#pragma once

#include "frame/types.h"
#include "transforms/kwfft_plan.h"

namespace tsm {

// plan of length m, else -20999; -20010 when a m does not fit in int32.
ErrorCode ReZoomTransform(const kwfft_table* plan, f64* x, int32 n, int32 a, int32 m, int32 k, int32 Q, cx* X);
ErrorCode CxZoomTransform(const kwfft_table* plan, cx* x, int32 n, int32 a, int32 m, int32 k, int32 Q, cx* X);

}  // namespace tsm
