// Entries of the chirp-Z, zoom and 2-D FFT transforms. The zoom and 2-D
// entries keep their plans between calls like the 1-D FFT entries: plain
// entries in holders with a host clean-up, _IDP entries in a reserved record
// (2-D: plan0 for the columns' length cols, plan1 for rows).
#include <cstring>

#include "entries/fft_state.h"
#include "frame/entry.h"
#include "transforms/chirpz.h"
#include "transforms/fft2d.h"
#include "transforms/zoom.h"

using namespace tsm;
using Cx = tsm::cx;

namespace {

Cx Load(const ::cx* p) {
  Cx v;
  std::memcpy(&v, p, sizeof v);
  return v;
}

template <class Block, class Kernel>
int32 ChirpZEntry(Block** x, const ::cx* A, const ::cx* W, int32 outputSize, int32 method, CxArrayHdl X,
                  Kernel kernel) {
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_ERR_EMPTY, X);
  if (static_cast<uint32>(method) > kChirpZBluestein) return FailB(TSM_ERR_BAD_SELECTOR, X);
  const int32 M = outputSize < 1 ? n : outputSize;
  if (ResizeOutput(X, M) != 0) return FailB(TSM_ERR_NO_MEMORY, X);
  const ErrorCode code = kernel(Elems(x), n, Load(A), Load(W), M, method, Elems(X));
  return ReportB(code, X);
}

// Plans of the two dimensions: two plain holders, or the two slots of one
// reserved record.
struct PlainPair {
  PlanHolder** cols;
  PlanHolder** rows;
  ErrorCode Ensure(int32 nc, int32 nr, kwfft_table** pc, kwfft_table** pr) const {
    const ErrorCode e = PlainPlanState{cols}.Ensure(nc, pc);
    return e != TSM_SUCCESS ? e : PlainPlanState{rows}.Ensure(nr, pr);
  }
};
struct ReservedPair {
  ReservedTransformState** state;
  ErrorCode Ensure(int32 nc, int32 nr, kwfft_table** pc, kwfft_table** pr) const {
    const ErrorCode e = ReservedPlanState{state}.Ensure(nc, pc, 0);
    return e != TSM_SUCCESS ? e : ReservedPlanState{state}.Ensure(nr, pr, 1);
  }
};

template <class Block, class State, class Kernel>
int32 ZoomEntry(Block** x, int32 decimation, int32 length, int32 startBin, int32 outputSize, CxArrayHdl X,
                const State& state, Kernel kernel) {
  if (decimation < 1) return FailB(TSM_ERR_ORDER_TOO_LOW, X);
  if (outputSize < 1 || length < 1) return FailB(TSM_ERR_TRANSFORM_SIZE, X);
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_SUCCESS, X);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(length, &plan); e != TSM_SUCCESS) return FailB(e, X);
  if (const int32 r = ResizeOutput(X, outputSize); r != 0) return FailB(r, X);
  const ErrorCode code = kernel(plan, Elems(x), n, decimation, length, startBin, outputSize, Elems(X));
  return ReportB(code, X);
}

template <class Block, class State, class Kernel>
int32 Fft2DEntry(Block** x, int32 rowOffset, int32 colOffset, int32 rows, int32 cols, int32 shift, CxMatrixHdl X,
                 const State& state, Kernel kernel) {
  const int32 inRows = Dim(x, 0), inCols = Dim(x, 1);
  if (inRows < 1 || inCols < 1) return FailB(TSM_ERR_EMPTY, X);
  if (rowOffset >= inRows || colOffset >= inCols) return FailB(TSM_ERR_INDEX_RANGE, X);
  if (rows < 1 || cols < 1) return FailB(TSM_ERR_SIZE_PAIR, X);
  kwfft_table *planCols = nullptr, *planRows = nullptr;
  if (const ErrorCode e = state.Ensure(cols, rows, &planCols, &planRows); e != TSM_SUCCESS) return FailB(e, X);
  if (const int32 r = ResizeOutput(X, rows, cols); r != 0) return FailB(r, X);
  const ErrorCode code =
      kernel(planCols, planRows, Elems(x), inRows, inCols, rowOffset, colOffset, rows, cols, shift, Elems(X));
  return ReportB(code, X);
}

template <class Out, class State, class Kernel>
int32 InvFft2DEntry(CxMatrixHdl X, int32 shift, Out**& x, const State& state, Kernel kernel) {
  const int32 rows = Dim(X, 0), cols = Dim(X, 1);
  if (rows < 1 || cols < 1) return FailB(TSM_ERR_EMPTY, x);
  kwfft_table *planCols = nullptr, *planRows = nullptr;
  if (const ErrorCode e = state.Ensure(cols, rows, &planCols, &planRows); e != TSM_SUCCESS) return FailB(e, x);
  if (const int32 r = ResizeOutput(x, rows, cols); r != 0) return FailB(r, x);
  const ErrorCode code = kernel(planCols, planRows, Elems(X), rows, cols, shift, Elems(x));
  return ReportB(code, x);
}

}  // namespace

extern "C" {

int32_t ChirpZT_head(F64ArrayHdl x, ::cx* A, ::cx* W, int32_t outputSize, int32_t method, CxArrayHdl X) {
  return ChirpZEntry(x, A, W, outputSize, method, X, ChirpZ);
}
int32_t CxChirpZT_head(CxArrayHdl x, ::cx* A, ::cx* W, int32_t outputSize, int32_t method, CxArrayHdl X) {
  return ChirpZEntry(x, A, W, outputSize, method, X, CxChirpZ);
}

int32_t InvChirpZT_head(CxArrayHdl X, ::cx* A, ::cx* W, int32_t outputSize, CxArrayHdl x) {
  const int32 n = Count(X);
  if (n < 1) return FailB(TSM_ERR_EMPTY, x);
  const int32 M = outputSize < 1 ? n : outputSize;
  if (M > n) return FailB(TSM_ERR_SIZE_PAIR, x);
  if (ResizeOutput(x, M) != 0) return FailB(TSM_ERR_NO_MEMORY, x);
  const ErrorCode code = InvChirpZ(Elems(X), M, Load(A), Load(W), Elems(x));
  return ReportB(code, x);
}

int32_t ReDZTH(F64ArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize,
               CxArrayHdl X, PlanHolder** state) {
  return ZoomEntry(x, decimation, length, startBin, outputSize, X, PlainPlanState{state}, ReZoomTransform);
}
int32_t ReDZTH_IDP(F64ArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize,
                   CxArrayHdl X, ReservedTransformState** state) {
  return ZoomEntry(x, decimation, length, startBin, outputSize, X, ReservedPlanState{state}, ReZoomTransform);
}
int32_t CxDZTH(CxArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize,
               CxArrayHdl X, PlanHolder** state) {
  return ZoomEntry(x, decimation, length, startBin, outputSize, X, PlainPlanState{state}, CxZoomTransform);
}
int32_t CxDZTH_IDP(CxArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize,
                   CxArrayHdl X, ReservedTransformState** state) {
  return ZoomEntry(x, decimation, length, startBin, outputSize, X, ReservedPlanState{state}, CxZoomTransform);
}

int32_t ReFFT2D_H(MatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift,
                  CxMatrixHdl X, PlanHolder** stateCols, PlanHolder** stateRows) {
  return Fft2DEntry(x, rowOffset, colOffset, rows, cols, shift, X, PlainPair{stateCols, stateRows}, ReFft2D);
}
int32_t ReFFT2D_H_IDP(MatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift,
                      CxMatrixHdl X, ReservedTransformState** state) {
  return Fft2DEntry(x, rowOffset, colOffset, rows, cols, shift, X, ReservedPair{state}, ReFft2D);
}
int32_t CxFFT2D_H(CxMatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift,
                  CxMatrixHdl X, PlanHolder** stateCols, PlanHolder** stateRows) {
  return Fft2DEntry(x, rowOffset, colOffset, rows, cols, shift, X, PlainPair{stateCols, stateRows}, CxFft2D);
}
int32_t CxFFT2D_H_IDP(CxMatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift,
                      CxMatrixHdl X, ReservedTransformState** state) {
  return Fft2DEntry(x, rowOffset, colOffset, rows, cols, shift, X, ReservedPair{state}, CxFft2D);
}
int32_t ReInvFFT2D_H(CxMatrixHdl X, int32_t shift, MatrixHdl x, PlanHolder** stateCols, PlanHolder** stateRows) {
  return InvFft2DEntry(X, shift, x, PlainPair{stateCols, stateRows}, ReInvFft2D);
}
int32_t ReInvFFT2D_H_IDP(CxMatrixHdl X, int32_t shift, MatrixHdl x, ReservedTransformState** state) {
  return InvFft2DEntry(X, shift, x, ReservedPair{state}, ReInvFft2D);
}
int32_t CxInvFFT2D_H(CxMatrixHdl X, int32_t shift, CxMatrixHdl x, PlanHolder** stateCols, PlanHolder** stateRows) {
  return InvFft2DEntry(X, shift, x, PlainPair{stateCols, stateRows}, CxInvFft2D);
}
int32_t CxInvFFT2D_H_IDP(CxMatrixHdl X, int32_t shift, CxMatrixHdl x, ReservedTransformState** state) {
  return InvFft2DEntry(X, shift, x, ReservedPair{state}, CxInvFft2D);
}

}  // extern "C"
