// 2-D FFT: a row stage over the rows that exist, then a column stage over
// every column that carries information (cols/2 + 1 of them for real data).
#include "transforms/fft2d.h"

#include <algorithm>
#include <cstring>

#include "frame/cx_ops.h"
#include "frame/heap.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

// Transforms columns 0 .. ncols-1 of a rows x stride matrix in place. The
// columns go in blocks of kColumnBlock through a rows x block buffer, so
// that the gather and the scatter read whole cache lines of each row.
constexpr int32 kColumnBlock = 8;

ErrorCode ColumnStage(const kwfft_table* planRows, cx* a, int32 rows, int32 stride, int32 ncols, bool inverse) {
  HeapScratch<cx> block, out;
  if (!block.Allocate(static_cast<std::int64_t>(rows) * kColumnBlock) ||
      !out.Allocate(rows))
    return TSM_ERR_NO_MEMORY;
  for (int32 c0 = 0; c0 < ncols; c0 += kColumnBlock) {
    const int32 b = std::min(kColumnBlock, ncols - c0);
    for (int32 r = 0; r < rows; ++r) {
      const cx* row = a + static_cast<std::int64_t>(r) * stride + c0;
      std::copy(row, row + b, block.get() + static_cast<std::int64_t>(r) * b);
    }
    for (int32 j = 0; j < b; ++j) {
      const cx* in = block.get() + j;
      const ErrorCode e =
          inverse ? kwfft_complex_inverse(planRows, &in->re, &in->im, &out[0].re, &out[0].im, 2 * b, 2, rows)
                  : kwfft_complex(planRows, &in->re, &in->im, &out[0].re, &out[0].im, 2 * b, 2, rows);
      if (e != TSM_SUCCESS) return e;
      for (int32 r = 0; r < rows; ++r) a[static_cast<std::int64_t>(r) * stride + c0 + j] = out[r];
    }
  }
  return TSM_SUCCESS;
}

// Rotates each row right by cols/2 and the rows down by rows/2 (forward), or
// back (inverse): the 1-D shift layout in both dimensions.
void Shift2D(cx* a, int32 rows, int32 cols, bool undo) {
  const std::int64_t total = static_cast<std::int64_t>(rows) * cols;
  for (std::int64_t r = 0; r < rows; ++r) {
    cx* row = a + r * cols;
    std::rotate(row, row + (undo ? cols / 2 : cols - cols / 2), row + cols);
  }
  const std::int64_t h = static_cast<std::int64_t>(undo ? rows / 2 : rows - rows / 2) * cols;
  std::rotate(a, a + h, a + total);
}

// The part of input row `r` that the window covers, zero-padded to cols in
// `pad` when the input ends first; null for a row past the input.
template <class T>
const T* WindowRow(const T* x, int32 inRows, int32 inCols, int32 rowOffset, int32 colOffset, int32 r, int32 cols,
                   T* pad) {
  if (r >= inRows - rowOffset) return nullptr;
  const T* src = x + static_cast<std::int64_t>(rowOffset + r) * inCols + colOffset;
  const int32 have = inCols - colOffset;
  if (have >= cols) return src;
  std::copy(src, src + have, pad);
  std::fill(pad + have, pad + cols, T{});
  return pad;
}

}  // namespace

ErrorCode ReFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const f64* x, int32 inRows,
                  int32 inCols, int32 rowOffset, int32 colOffset, int32 rows, int32 cols, int32 shift, cx* X) {
  if (rowOffset < 0 || colOffset < 0) return TSM_ERR_INDEX_RANGE;
  if (rows == 1 && cols == 1) {
    X[0] = cx{x[static_cast<std::int64_t>(rowOffset) * inCols + colOffset], 0.0};
    return TSM_SUCCESS;
  }
  const int32 half = cols / 2 + 1;
  HeapScratch<cx> H;
  HeapScratch<f64> pad, hc;
  if (!H.Allocate(static_cast<std::int64_t>(rows) * half) || !pad.Allocate(cols) ||
      !hc.Allocate(cols))
    return TSM_ERR_NO_MEMORY;
  std::fill(H.get(), H.get() + static_cast<std::int64_t>(rows) * half, cx{0.0, 0.0});  // rows past the input
  for (int32 r = 0; r < rows; ++r) {
    const f64* src = WindowRow(x, inRows, inCols, rowOffset, colOffset, r, cols, pad.get());
    if (src == nullptr) break;
    const ErrorCode e = kwfft_real(planCols, src, hc.get(), 1, 1, cols);
    if (e != TSM_SUCCESS) return e;
    cx* h = H.get() + static_cast<std::int64_t>(r) * half;
    h[0] = cx{hc[0], 0.0};
    for (int32 k = 1; k < cols - k; ++k) h[k] = cx{hc[k], hc[cols - k]};
    if (cols % 2 == 0) h[cols / 2] = cx{hc[cols / 2], 0.0};
  }
  if (const ErrorCode e = ColumnStage(planRows, H.get(), rows, half, half, false); e != TSM_SUCCESS) return e;
  // The missing columns by X[r][c] = conj(X[-r mod rows][cols - c]).
  for (int32 r = 0; r < rows; ++r) {
    cx* row = X + static_cast<std::int64_t>(r) * cols;
    std::copy(H.get() + static_cast<std::int64_t>(r) * half, H.get() + static_cast<std::int64_t>(r + 1) * half, row);
    const cx* mirror = H.get() + static_cast<std::int64_t>((rows - r) % rows) * half;
    for (int32 c = half; c < cols; ++c) row[c] = Conj(mirror[cols - c]);
  }
  if (shift != 0) Shift2D(X, rows, cols, false);
  return TSM_SUCCESS;
}

ErrorCode CxFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* x, int32 inRows,
                  int32 inCols, int32 rowOffset, int32 colOffset, int32 rows, int32 cols, int32 shift, cx* X) {
  if (rowOffset < 0 || colOffset < 0) return TSM_ERR_INDEX_RANGE;
  if (rows == 1 && cols == 1) {
    X[0] = x[static_cast<std::int64_t>(rowOffset) * inCols + colOffset];
    return TSM_SUCCESS;
  }
  HeapScratch<cx> pad;
  if (!pad.Allocate(cols)) return TSM_ERR_NO_MEMORY;
  std::fill(X, X + static_cast<std::int64_t>(rows) * cols, cx{0.0, 0.0});
  for (int32 r = 0; r < rows; ++r) {
    const cx* src = WindowRow(x, inRows, inCols, rowOffset, colOffset, r, cols, pad.get());
    if (src == nullptr) break;
    cx* row = X + static_cast<std::int64_t>(r) * cols;
    const ErrorCode e = kwfft_complex(planCols, &src->re, &src->im, &row->re, &row->im, 2, 2, cols);
    if (e != TSM_SUCCESS) return e;
  }
  if (const ErrorCode e = ColumnStage(planRows, X, rows, cols, cols, false); e != TSM_SUCCESS) return e;
  if (shift != 0) Shift2D(X, rows, cols, false);
  return TSM_SUCCESS;
}

namespace {

// The spectrum in heap scratch, unshifted, with the inverse column stage run
// over its first ncols columns.
ErrorCode InverseColumns(const kwfft_table* planRows, const cx* X, int32 rows, int32 cols, int32 shift,
                         int32 ncols, HeapScratch<cx>* S) {
  const std::int64_t total = static_cast<std::int64_t>(rows) * cols;
  if (!S->Allocate(total)) return TSM_ERR_NO_MEMORY;
  std::copy(X, X + total, S->get());
  if (shift != 0) Shift2D(S->get(), rows, cols, true);
  return ColumnStage(planRows, S->get(), rows, cols, ncols, true);
}

}  // namespace

ErrorCode ReInvFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* X, int32 rows,
                     int32 cols, int32 shift, f64* x) {
  HeapScratch<cx> S;
  HeapScratch<f64> hc;
  if (!hc.Allocate(cols)) return TSM_ERR_NO_MEMORY;
  if (const ErrorCode e = InverseColumns(planRows, X, rows, cols, shift, cols / 2 + 1, &S); e != TSM_SUCCESS)
    return e;
  for (int32 r = 0; r < rows; ++r) {
    kwfft_pack_halfcomplex(S.get() + static_cast<std::int64_t>(r) * cols, cols, 0, hc.get());
    const ErrorCode e = kwfft_real_inverse(planCols, hc.get(), x + static_cast<std::int64_t>(r) * cols, 1, 1, cols);
    if (e != TSM_SUCCESS) return e;
  }
  return TSM_SUCCESS;
}

ErrorCode CxInvFft2D(const kwfft_table* planCols, const kwfft_table* planRows, const cx* X, int32 rows,
                     int32 cols, int32 shift, cx* x) {
  HeapScratch<cx> S;
  if (const ErrorCode e = InverseColumns(planRows, X, rows, cols, shift, cols, &S); e != TSM_SUCCESS) return e;
  for (int32 r = 0; r < rows; ++r) {
    const cx* in = S.get() + static_cast<std::int64_t>(r) * cols;
    cx* out = x + static_cast<std::int64_t>(r) * cols;
    const ErrorCode e = kwfft_complex_inverse(planCols, &in->re, &in->im, &out->re, &out->im, 2, 2, cols);
    if (e != TSM_SUCCESS) return e;
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
