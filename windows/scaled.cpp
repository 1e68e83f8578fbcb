#include "windows/scaled.h"

#include "frame/workspace.h"
#include "windows/apply.h"
#include "windows/cosine_sum.h"
#include "windows/selector.h"
#include "windows/special_windows.h"

namespace tsm {
namespace {

bool IsCosineSum(int32 selector) { return CosineSumCoefficients(selector).a != nullptr; }

bool IsMeasured(int32 selector) {
  return (selector >= kWinTriangle && selector <= kWinWelch) ||
         (selector >= kWinKaiser && selector <= kWinGaussian);
}

// Front scratch of n ones.
ErrorCode Ones(Scratch<f64>& w, int32 n) {
  if (w.Allocate(n) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  for (int32 i = 0; i < n; ++i) w[i] = 1.0;
  return TSM_SUCCESS;
}

// The periodic window of a measured selector, made on ones and measured.
ErrorCode MeasuredWindow(Scratch<f64>& w, int32 n, int32 selector, f64 param, WinConsts* consts) {
  ErrorCode e = Ones(w, n);
  if (e == TSM_SUCCESS) e = FormulaWindowBySelector(w.get(), n, selector, param);
  if (e == TSM_SUCCESS) e = MeasureWindow(w.get(), n, consts);
  return e;
}

template <class T>
ErrorCode ScaledWindowOrFail(T* x, int32 n, int32 selector, f64 param, WinConsts* consts) {
  if (n < 0) return TSM_ERR_NEGATIVE_DIMENSION;
  if (selector == kWinRectangular) return WindowConstTable(selector, consts);
  if (IsCosineSum(selector)) {
    const ErrorCode e = WindowConstTable(selector, consts);
    if (e != TSM_SUCCESS || n < 1) return e;
    return SelectorCosineWindow(x, n, selector, true);
  }
  if (!IsMeasured(selector)) return TSM_ERR_BAD_SELECTOR;
  Scratch<f64> w;
  const ErrorCode e = MeasuredWindow(w, n, selector, param, consts);
  if (e != TSM_SUCCESS) return e;
  for (int32 i = 0; i < n; ++i) w[i] /= consts->cg;
  MultiplyByWindow(x, w.get(), n);
  return TSM_SUCCESS;
}

}  // namespace

template <class T>
ErrorCode ScaledWindow(T* x, int32 n, int32 selector, f64 param, WinConsts* consts) {
  const ErrorCode e = ScaledWindowOrFail(x, n, selector, param, consts);
  if (e != TSM_SUCCESS) *consts = WinConsts{kNaN, kNaN};
  return e;
}

template <class T>
ErrorCode SymmetricWindow(T* x, int32 n, int32 selector, f64 param) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  Scratch<f64> w;
  ErrorCode e = Ones(w, n);
  if (e != TSM_SUCCESS) return e;
  if (selector == kWinDolphChebyshev) {
    e = DolphChebyshevWindow(w.get(), n, param, true);
  } else if (selector == kWinGaussian) {
    e = GaussWindow(w.get(), n, param, true);
  } else if (selector != kWinRectangular) {
    if (IsCosineSum(selector))
      e = SelectorCosineWindow(w.get(), n - 1, selector, false);
    else if (IsMeasured(selector))
      e = FormulaWindowBySelector(w.get(), n - 1, selector, param);
    else
      e = TSM_ERR_BAD_SELECTOR;
    w[n - 1] = w[0];
  }
  if (e != TSM_SUCCESS) return e;
  MultiplyByWindow(x, w.get(), n);
  return TSM_SUCCESS;
}

ErrorCode WindowConstsByName(int32 n, int32 selector, f64 param, WinConsts* consts) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (selector >= kWinRectangular && selector <= kWinBlackmanNuttall) return WindowConstTable(selector, consts);
  if (!IsMeasured(selector)) return TSM_ERR_BAD_SELECTOR;
  Scratch<f64> w;
  WinConsts measured;
  const ErrorCode e = MeasuredWindow(w, n, selector, param, &measured);
  if (e == TSM_SUCCESS) *consts = measured;
  return e;
}

template ErrorCode ScaledWindow(f64*, int32, int32, f64, WinConsts*);
template ErrorCode ScaledWindow(cx*, int32, int32, f64, WinConsts*);
template ErrorCode SymmetricWindow(f64*, int32, int32, f64);
template ErrorCode SymmetricWindow(cx*, int32, int32, f64);

}  // namespace tsm
