// 1-D FFT entries, plain (state held through a registered clean-up) and
// _IDP (state in a record the host releases with TransformUnreserveProc).
#include <algorithm>
#include <cstring>

#include "entries/fft_state.h"
#include "frame/entry.h"
#include "frame/workspace.h"
#include "transforms/kwfft.h"

using namespace tsm;
using Cx = tsm::cx;

namespace {

// Scratch of n values from the allocator front, freed on scope exit.
using Buffer = Scratch<f64>;

// The real forward transform of fftSize samples from `offset`, zero-padded
// or truncated, as a full (optionally shifted) spectrum.
template <class State>
int32 ReFft80(F64ArrayHdl x, CxArrayHdl X, const State& state, int32 offset, int32 fftSize, int32 shift) {
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_ERR_EMPTY, X);
  if (offset < 0 || offset > n - 1) return FailB(TSM_ERR_INDEX_RANGE, X);
  if (fftSize < 1) return FailB(TSM_ERR_TRANSFORM_SIZE, X);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(fftSize, &plan); e != TSM_SUCCESS) return FailB(e, X);
  if (const int32 r = ResizeOutput(X, fftSize); r != 0) return FailB(r, X);
  Buffer padded;
  const f64* in = Elems(x) + offset;
  if (n - offset < fftSize) {
    if (padded.Allocate(fftSize) != TSM_SUCCESS) return FailB(TSM_ERR_NO_MEMORY, X);
    std::memcpy(padded.get(), in, sizeof(f64) * static_cast<size_t>(n - offset));
    std::fill(padded.get() + (n - offset), padded.get() + fftSize, 0.0);
    in = padded.get();
  }
  Cx* out = Elems(X);
  const ErrorCode e = kwfft_real(plan, in, &out[0].re, 1, 2, fftSize);
  if (e != TSM_SUCCESS) return FailB(e, X);
  kwfft_unpack_halfcomplex(out, fftSize, shift);
  return TSM_SUCCESS;
}

// Rotates the n values of a right by h, through a scratch of n - h values.
ErrorCode RotateRight(Cx* a, int32 n, int32 h) {
  Scratch<Cx> head;
  if (head.Allocate(n - h) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  std::memcpy(head.get(), a, sizeof(Cx) * static_cast<size_t>(n - h));
  std::memmove(a, a + (n - h), sizeof(Cx) * static_cast<size_t>(h));
  std::memcpy(a + h, head.get(), sizeof(Cx) * static_cast<size_t>(n - h));
  return TSM_SUCCESS;
}

// The complex forward transform. The offset is not checked: samples outside
// the input read as zeros.
template <class State>
int32 CxFft80(CxArrayHdl x, CxArrayHdl X, const State& state, int32 offset, int32 fftSize, int32 shift) {
  const int32 n = Count(x);
  if (n < 1) return FailB(TSM_ERR_EMPTY, X);
  if (fftSize < 1) return FailB(TSM_ERR_TRANSFORM_SIZE, X);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(fftSize, &plan); e != TSM_SUCCESS) return FailB(e, X);
  Scratch<Cx> window;
  const std::int64_t first = offset, end = static_cast<std::int64_t>(offset) + fftSize;
  if (first < 0 || end > n) {
    if (window.Allocate(fftSize) != TSM_SUCCESS) return FailB(TSM_ERR_NO_MEMORY, X);
    for (std::int64_t i = first; i < end; ++i)
      window[i - first] = i >= 0 && i < n ? Elems(x)[i] : Cx{0.0, 0.0};
  }
  if (const int32 r = ResizeOutput(X, fftSize); r != 0) return FailB(r, X);
  const Cx* in = window.get() != nullptr ? window.get() : Elems(x) + offset;
  Cx* out = Elems(X);
  ErrorCode e = kwfft_complex(plan, &in[0].re, &in[0].im, &out[0].re, &out[0].im, 2, 2, fftSize);
  if (e == TSM_SUCCESS && shift != 0) e = RotateRight(out, fftSize, fftSize / 2);
  return e == TSM_SUCCESS ? TSM_SUCCESS : FailB(e, X);
}

template <class State>
int32 InvReFft80(CxArrayHdl X, F64ArrayHdl x, const State& state, int32 shift) {
  const int32 n = Count(X);
  if (n < 1) return FailB(TSM_ERR_EMPTY, x);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(n, &plan); e != TSM_SUCCESS) return FailB(e, x);
  Buffer hc;
  if (hc.Allocate(n) != TSM_SUCCESS) return FailB(TSM_ERR_NO_MEMORY, x);
  if (const int32 r = ResizeOutput(x, n); r != 0) return FailB(r, x);
  kwfft_pack_halfcomplex(Elems(X), n, shift, hc.get());
  const ErrorCode e = kwfft_real_inverse(plan, hc.get(), Elems(x), 1, 1, n);
  return e == TSM_SUCCESS ? TSM_SUCCESS : FailB(e, x);
}

template <class State>
int32 InvCxFft80(CxArrayHdl X, CxArrayHdl x, const State& state, int32 shift) {
  const int32 n = Count(X);
  if (n < 1) return FailB(TSM_ERR_EMPTY, x);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(n, &plan); e != TSM_SUCCESS) return FailB(e, x);
  if (const int32 r = ResizeOutput(x, n); r != 0) return FailB(r, x);
  Scratch<Cx> unshifted;
  const Cx* in = Elems(X);
  if (shift != 0) {  // bins from index n/2 on first, then those before it
    const int32 h = n / 2;
    if (unshifted.Allocate(n) != TSM_SUCCESS) return FailB(TSM_ERR_NO_MEMORY, x);
    std::memcpy(unshifted.get(), in + h, sizeof(Cx) * static_cast<size_t>(n - h));
    std::memcpy(unshifted.get() + (n - h), in, sizeof(Cx) * static_cast<size_t>(h));
    in = unshifted.get();
  }
  Cx* out = Elems(x);
  const ErrorCode e = kwfft_complex_inverse(plan, &in[0].re, &in[0].im, &out[0].re, &out[0].im, 2, 2, n);
  return e == TSM_SUCCESS ? TSM_SUCCESS : FailB(e, x);
}

// The HalfComplex entries empty their float64 output with the complex type
// code, as they always have.
ErrorCode FailHalfComplex(ErrorCode code, F64ArrayHdl& out) {
  EmptyOutput(out, TSM_TYPE_CX128);
  return code;
}

template <class State>
int32 ReFftHc(F64ArrayHdl x, F64ArrayHdl y, const State& state) {
  const int32 n = Count(x);
  if (n < 1) return FailHalfComplex(TSM_ERR_EMPTY, y);
  if (const int32 r = ResizeOutput(y, n); r != 0) return FailHalfComplex(r, y);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(n, &plan); e != TSM_SUCCESS) return FailHalfComplex(e, y);
  const ErrorCode e = kwfft_real(plan, Elems(x), Elems(y), 1, 1, n);
  return e == TSM_SUCCESS ? TSM_SUCCESS : FailHalfComplex(e, y);
}

// Transforms straight out of the caller's block, which is left holding
// scaled Hartley values: a copy saved, by design.
template <class State>
int32 InvReFftHc(F64ArrayHdl y, F64ArrayHdl x, const State& state) {
  const int32 n = Count(y);
  if (n < 1) return FailHalfComplex(TSM_ERR_EMPTY, x);
  if (const int32 r = ResizeOutput(x, n); r != 0) return FailHalfComplex(r, x);
  kwfft_table* plan = nullptr;
  if (const ErrorCode e = state.Ensure(n, &plan); e != TSM_SUCCESS) return FailHalfComplex(e, x);
  const ErrorCode e = kwfft_real_inverse(plan, Elems(y), Elems(x), 1, 1, n);
  return e == TSM_SUCCESS ? TSM_SUCCESS : FailHalfComplex(e, x);
}

}  // namespace

extern "C" {

int32_t ReKWFFTH80(F64ArrayHdl x, CxArrayHdl X, PlanHolder** state, int32_t offset, int32_t fftSize, int32_t shift) {
  return ReFft80(x, X, PlainPlanState{state}, offset, fftSize, shift);
}
int32_t ReKWFFTH80_IDP(F64ArrayHdl x, CxArrayHdl X, ReservedTransformState** state, int32_t offset, int32_t fftSize,
                       int32_t shift) {
  return ReFft80(x, X, ReservedPlanState{state}, offset, fftSize, shift);
}
int32_t CxKWFFTH80(CxArrayHdl x, CxArrayHdl X, PlanHolder** state, int32_t offset, int32_t fftSize, int32_t shift) {
  return CxFft80(x, X, PlainPlanState{state}, offset, fftSize, shift);
}
int32_t CxKWFFTH80_IDP(CxArrayHdl x, CxArrayHdl X, ReservedTransformState** state, int32_t offset, int32_t fftSize,
                       int32_t shift) {
  return CxFft80(x, X, ReservedPlanState{state}, offset, fftSize, shift);
}
int32_t InvReKWFFTH80(CxArrayHdl X, F64ArrayHdl x, PlanHolder** state, int32_t shift) {
  return InvReFft80(X, x, PlainPlanState{state}, shift);
}
int32_t InvReKWFFTH80_IDP(CxArrayHdl X, F64ArrayHdl x, ReservedTransformState** state, int32_t shift) {
  return InvReFft80(X, x, ReservedPlanState{state}, shift);
}
int32_t InvCxKWFFTH80(CxArrayHdl X, CxArrayHdl x, PlanHolder** state, int32_t shift) {
  return InvCxFft80(X, x, PlainPlanState{state}, shift);
}
int32_t InvCxKWFFTH80_IDP(CxArrayHdl X, CxArrayHdl x, ReservedTransformState** state, int32_t shift) {
  return InvCxFft80(X, x, ReservedPlanState{state}, shift);
}
int32_t ReKWFFTHCH(F64ArrayHdl x, F64ArrayHdl y, PlanHolder** state) { return ReFftHc(x, y, PlainPlanState{state}); }
int32_t ReKWFFTHCH_IDP(F64ArrayHdl x, F64ArrayHdl y, ReservedTransformState** state) {
  return ReFftHc(x, y, ReservedPlanState{state});
}
int32_t InvReKWFFTHCH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state) {
  return InvReFftHc(y, x, PlainPlanState{state});
}
int32_t InvReKWFFTHCH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state) {
  return InvReFftHc(y, x, ReservedPlanState{state});
}

// Forwarders of the first generation.
int32_t ReKWFFTH(F64ArrayHdl x, CxArrayHdl X, PlanHolder** state) { return ReKWFFTH80(x, X, state, 0, Count(x), 0); }
int32_t CxKWFFTH(CxArrayHdl x, CxArrayHdl X, PlanHolder** state) { return CxKWFFTH80(x, X, state, 0, Count(x), 0); }
int32_t InvReKWFFTH(CxArrayHdl X, F64ArrayHdl x, PlanHolder** state) { return InvReKWFFTH80(X, x, state, 0); }
int32_t InvCxKWFFTH(CxArrayHdl X, CxArrayHdl x, PlanHolder** state) { return InvCxKWFFTH80(X, x, state, 0); }

// The plan cache, exported for hosts that run transforms of their own.
kwfft_table* create_kwfft_table(int32_t n) { return CreateKwfftTable(n); }
void destroy_kwfft_table(kwfft_table* plan) { DestroyKwfftTable(plan); }

}  // extern "C"
