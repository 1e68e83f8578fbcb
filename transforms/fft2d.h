// 2-D FFT of row-major matrices over two plans, one per dimension (planCols
// of length cols for the rows, planRows of length rows for the columns). The
// forward transforms read a rows x cols window of the input from
// (rowOffset, colOffset), zero-padded where the input ends, and write the
// full rows x cols spectrum. A non-zero shift puts bin 0 at (rows/2, cols/2)
// in both dimensions; the inverses undo it and scale by 1/(rows cols).
// Scratch comes from the C heap.
#pragma once

#include "frame/types.h"
#include "transforms/kwfft_plan.h"

namespace tsm {

// -20017 for a negative offset; the spectrum is Hermitian-completed from the
// cols/2 + 1 columns that are computed.
ErrorCode ReFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const f64* x, int32 inRows,
                  int32 inCols, int32 rowOffset, int32 colOffset, int32 rows, int32 cols, int32 shift, cx* X);
ErrorCode CxFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* x, int32 inRows,
                  int32 inCols, int32 rowOffset, int32 colOffset, int32 rows, int32 cols, int32 shift, cx* X);
// The real inverse reads only columns 0 .. cols/2 of the (unshifted) spectrum.
ErrorCode ReInvFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* X, int32 rows,
                     int32 cols, int32 shift, f64* x);
ErrorCode CxInvFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* X, int32 rows,
                     int32 cols, int32 shift, cx* x);

}  // namespace tsm
