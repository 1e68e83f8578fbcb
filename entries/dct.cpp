// DCT and DST entries in one and two dimensions, plain and _IDP. The 2-D
// entries keep the plan of the transforms of length rows first (plain: the
// first state argument; _IDP: plan0) and that of length cols second.
#include <algorithm>
#include <climits>

#include "entries/fft_state.h"
#include "frame/entry.h"
#include "transforms/dct.h"

using namespace tsm;

namespace {

// The plan for a transform of n points, by the kind's rule; a length beyond
// int32 cannot be planned.
template <class State>
ErrorCode EnsureTrigPlan(const State& state, TrigKind kind, int32 n, kwfft_table** plan) {
  const std::int64_t length = TrigPlanLength(kind, n);
  if (length > INT32_MAX) return TSM_ERR_NO_MEMORY;
  return state.Ensure(static_cast<int32>(length), plan);
}

// The second dimension of an _IDP state.
struct ColsSlot {
  ReservedPlanState state;
  ErrorCode Ensure(int32 length, kwfft_table** plan) const { return state.Ensure(length, plan, 1); }
};

// size below 1 takes the input's count; the inverses pass 0.
template <class State>
int32 Frame1D(TrigKind kind, F64ArrayHdl x, F64ArrayHdl y, int32 size, const State& state) {
  const int32 count = Count(x);
  if (count < 1) return FailB(TSM_ERR_EMPTY, y);
  const int32 n = size < 1 ? count : size;
  if (ResizeOutput(y, n) != 0) return FailB(TSM_ERR_NO_MEMORY, y);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = EnsureTrigPlan(state, kind, n, &plan); e != TSM_SUCCESS) return FailB(e, y);
  return ReportB(TrigTransform(kind, plan, Elems(x), std::min(count, n), Elems(y), n), y);
}

template <class RowsState, class ColsState>
int32 Frame2D(TrigKind kind, MatrixHdl x, MatrixHdl y, int32 rows, int32 cols, const RowsState& stateRows,
              const ColsState& stateCols) {
  const int32 xRows = Dim(x, 0), xCols = Dim(x, 1);
  if (xRows < 1 || xCols < 1) return FailB(TSM_ERR_EMPTY, y);
  if (rows < 1) rows = xRows;
  if (cols < 1) cols = xCols;
  kwfft_table *planRows = nullptr, *planCols = nullptr;
  if (const ErrorCode e = EnsureTrigPlan(stateRows, kind, rows, &planRows); e != TSM_SUCCESS) return FailB(e, y);
  // A reference of the call's own keeps the rows plan alive should both state
  // arguments name one holder, which the cols plan then replaces.
  const KwfftTableReference keepRows(CreateKwfftTable(planRows->n));
  if (keepRows == nullptr) return FailB(TSM_ERR_NO_MEMORY, y);
  if (const ErrorCode e = EnsureTrigPlan(stateCols, kind, cols, &planCols); e != TSM_SUCCESS) return FailB(e, y);
  if (static_cast<std::int64_t>(rows) * cols > INT32_MAX || ResizeOutput(y, rows, cols) != 0)
    return FailB(TSM_ERR_NO_MEMORY, y);
  return ReportB(TrigTransform2D(kind, keepRows.get(), planCols, Elems(x), xRows, xCols, Elems(y), rows, cols), y);
}

int32 Plain2D(TrigKind kind, MatrixHdl x, MatrixHdl y, int32 rows, int32 cols, PlanHolder** stateRows,
              PlanHolder** stateCols) {
  return Frame2D(kind, x, y, rows, cols, PlainPlanState{stateRows}, PlainPlanState{stateCols});
}

int32 Reserved2D(TrigKind kind, MatrixHdl x, MatrixHdl y, int32 rows, int32 cols, ReservedTransformState** state) {
  return Frame2D(kind, x, y, rows, cols, ReservedPlanState{state}, ColsSlot{ReservedPlanState{state}});
}

constexpr TrigKind kDct = TrigKind::kDct, kInvDct = TrigKind::kInverseDct;
constexpr TrigKind kDst = TrigKind::kDst, kInvDst = TrigKind::kInverseDst;

}  // namespace

extern "C" {

int32_t DCT_1DH(F64ArrayHdl x, F64ArrayHdl y, int32_t size, PlanHolder** state) {
  return Frame1D(kDct, x, y, size, PlainPlanState{state});
}
int32_t DCT_1DH_IDP(F64ArrayHdl x, F64ArrayHdl y, int32_t size, ReservedTransformState** state) {
  return Frame1D(kDct, x, y, size, ReservedPlanState{state});
}
int32_t DST_1DH(F64ArrayHdl x, F64ArrayHdl y, int32_t size, PlanHolder** state) {
  return Frame1D(kDst, x, y, size, PlainPlanState{state});
}
int32_t DST_1DH_IDP(F64ArrayHdl x, F64ArrayHdl y, int32_t size, ReservedTransformState** state) {
  return Frame1D(kDst, x, y, size, ReservedPlanState{state});
}
int32_t InvDCT_1DH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state) {
  return Frame1D(kInvDct, y, x, 0, PlainPlanState{state});
}
int32_t InvDCT_1DH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state) {
  return Frame1D(kInvDct, y, x, 0, ReservedPlanState{state});
}
int32_t InvDST_1DH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state) {
  return Frame1D(kInvDst, y, x, 0, PlainPlanState{state});
}
int32_t InvDST_1DH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state) {
  return Frame1D(kInvDst, y, x, 0, ReservedPlanState{state});
}

int32_t DCT_2DH(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, PlanHolder** stateRows, PlanHolder** stateCols) {
  return Plain2D(kDct, x, y, rows, cols, stateRows, stateCols);
}
int32_t DCT_2DH_IDP(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, ReservedTransformState** state) {
  return Reserved2D(kDct, x, y, rows, cols, state);
}
int32_t DST_2DH(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, PlanHolder** stateRows, PlanHolder** stateCols) {
  return Plain2D(kDst, x, y, rows, cols, stateRows, stateCols);
}
int32_t DST_2DH_IDP(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, ReservedTransformState** state) {
  return Reserved2D(kDst, x, y, rows, cols, state);
}
int32_t InvDCT_2DH(MatrixHdl y, MatrixHdl x, PlanHolder** stateRows, PlanHolder** stateCols) {
  return Plain2D(kInvDct, y, x, 0, 0, stateRows, stateCols);
}
int32_t InvDCT_2DH_IDP(MatrixHdl y, MatrixHdl x, ReservedTransformState** state) {
  return Reserved2D(kInvDct, y, x, 0, 0, state);
}
int32_t InvDST_2DH(MatrixHdl y, MatrixHdl x, PlanHolder** stateRows, PlanHolder** stateCols) {
  return Plain2D(kInvDst, y, x, 0, 0, stateRows, stateCols);
}
int32_t InvDST_2DH_IDP(MatrixHdl y, MatrixHdl x, ReservedTransformState** state) {
  return Reserved2D(kInvDst, y, x, 0, 0, state);
}

}  // extern "C"
