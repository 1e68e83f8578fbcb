// Spectra, Hilbert and Hartley entries, plain and _IDP. The state only keeps
// a plan of the array's length alive; the kernels take their own reference
// to it from the cache.
#include "entries/fft_state.h"
#include "frame/entry.h"
#include "transforms/spectrum.h"

using namespace tsm;

namespace {

template <class State>
ErrorCode KeepPlan(const State& state, int32 n) {
  kwfft_table* plan = nullptr;
  return state.Ensure(n, &plan);
}

// The transforms in place in x.
template <class State>
int32 InPlace(ErrorCode (*kernel)(f64*, int32), F64ArrayHdl x, const State& state) {
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_ERR_EMPTY, x);
  if (const ErrorCode e = KeepPlan(state, n); e != TSM_SUCCESS) return FailB(e, x);
  return ReportB(kernel(Elems(x), n), x);
}

template <class State>
int32 CxSpectrum(CxArrayHdl x, F64ArrayHdl s, const State& state) {
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_ERR_EMPTY, s);
  if (ResizeOutput(s, n) != 0) return FailB(TSM_ERR_NO_MEMORY, s);
  if (const ErrorCode e = KeepPlan(state, n); e != TSM_SUCCESS) return FailB(e, s);
  return ReportB(CxPowerSpectrum(Elems(x), n, Elems(s)), s);
}

template <class Block, class State>
int32 Cross(ErrorCode (*kernel)(const ElemOf<Block>*, const ElemOf<Block>*, int32, tsm::cx*), Block** x, Block** y,
            CxArrayHdl S, const State& state) {
  const int32 n = Count(x);
  if (n < 1 || Count(y) < 1) return FailB(TSM_ERR_EMPTY, S);
  if (Count(y) != n) return FailB(TSM_ERR_SIZE_MISMATCH, S);
  if (ResizeOutput(S, n) != 0) return FailB(TSM_ERR_NO_MEMORY, S);
  if (const ErrorCode e = KeepPlan(state, n); e != TSM_SUCCESS) return FailB(e, S);
  return ReportB(kernel(Elems(x), Elems(y), n, Elems(S)), S);
}

}  // namespace

extern "C" {

int32_t SpectrumH(F64ArrayHdl x, PlanHolder** state) { return InPlace(PowerSpectrum, x, PlainPlanState{state}); }
int32_t SpectrumH_IDP(F64ArrayHdl x, ReservedTransformState** state) {
  return InPlace(PowerSpectrum, x, ReservedPlanState{state});
}
int32_t CxSpectrumH(CxArrayHdl x, F64ArrayHdl s, PlanHolder** state) { return CxSpectrum(x, s, PlainPlanState{state}); }
int32_t CxSpectrumH_IDP(CxArrayHdl x, F64ArrayHdl s, ReservedTransformState** state) {
  return CxSpectrum(x, s, ReservedPlanState{state});
}
int32_t CrossSpectrumH(F64ArrayHdl x, F64ArrayHdl y, CxArrayHdl S, PlanHolder** state) {
  return Cross(CrossPowerSpectrum, x, y, S, PlainPlanState{state});
}
int32_t CrossSpectrumH_IDP(F64ArrayHdl x, F64ArrayHdl y, CxArrayHdl S, ReservedTransformState** state) {
  return Cross(CrossPowerSpectrum, x, y, S, ReservedPlanState{state});
}
int32_t CxCrossSpectrumH(CxArrayHdl x, CxArrayHdl y, CxArrayHdl S, PlanHolder** state) {
  return Cross(CxCrossPowerSpectrum, x, y, S, PlainPlanState{state});
}
int32_t CxCrossSpectrumH_IDP(CxArrayHdl x, CxArrayHdl y, CxArrayHdl S, ReservedTransformState** state) {
  return Cross(CxCrossPowerSpectrum, x, y, S, ReservedPlanState{state});
}
int32_t FastHilbertTransformH(F64ArrayHdl x, PlanHolder** state) {
  return InPlace(HilbertTransform, x, PlainPlanState{state});
}
int32_t FastHilbertTransformH_IDP(F64ArrayHdl x, ReservedTransformState** state) {
  return InPlace(HilbertTransform, x, ReservedPlanState{state});
}
int32_t InvFastHilbertTransformH(F64ArrayHdl x, PlanHolder** state) {
  return InPlace(InverseHilbertTransform, x, PlainPlanState{state});
}
int32_t InvFastHilbertTransformH_IDP(F64ArrayHdl x, ReservedTransformState** state) {
  return InPlace(InverseHilbertTransform, x, ReservedPlanState{state});
}
int32_t FHTH(F64ArrayHdl x, PlanHolder** state) { return InPlace(HartleyTransform, x, PlainPlanState{state}); }
int32_t FHTH_IDP(F64ArrayHdl x, ReservedTransformState** state) {
  return InPlace(HartleyTransform, x, ReservedPlanState{state});
}
int32_t InvFHTH(F64ArrayHdl x, PlanHolder** state) { return InPlace(InverseHartleyTransform, x, PlainPlanState{state}); }
int32_t InvFHTH_IDP(F64ArrayHdl x, ReservedTransformState** state) {
  return InPlace(InverseHartleyTransform, x, ReservedPlanState{state});
}

}  // extern "C"
