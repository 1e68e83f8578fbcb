// Window entries: each multiplies its array in place. An empty array is
// reported with -20003 and left as it is; after a kernel failure the array is
// emptied.
#include "frame/entry.h"
#include "windows/cosine_sum.h"
#include "windows/formula.h"
#include "windows/scaled.h"
#include "windows/selector.h"
#include "windows/special_windows.h"

using namespace tsm;

namespace {

constexpr f64 kCosTaperedRatio = 0.2;

// Form B: kernel(elements, n) on a non-empty array.
template <class Block, class Kernel>
int32 WindowB(Block** x, Kernel kernel) {
  const int32 n = Count(x);
  if (n < 1) return TSM_ERR_EMPTY;
  const ErrorCode e = kernel(Elems(x), n);
  return Failed(e, FailOn::kNonZero) ? FailB(e, x) : e;
}

// Form A: the same with the code in the error out-argument.
template <class Kernel>
int32 WindowA(F64ArrayHdl x, int32* err, Kernel kernel) {
  *err = TSM_SUCCESS;
  const int32 n = Count(x);
  if (n < 1) {
    *err = TSM_ERR_EMPTY;
    return 0;
  }
  const ErrorCode e = kernel(Elems(x), n);
  return Failed(e, FailOn::kNonZero) ? FailA(err, e, x) : 0;
}

template <class Block>
int32 GenCos(Block** x, F64ArrayHdl coefs, bool normalise) {
  return WindowB(x, [&](auto* v, int32 n) { return CosineSumWindow(v, n, Elems(coefs), Count(coefs), normalise); });
}

template <class Block>
int32 ScaledWin(Block** x, int32 selector, f64 param, WinConsts* consts) {
  const ErrorCode e = ScaledWindow(Elems(x), Count(x), selector, param, consts);
  return Failed(e, FailOn::kNonZero) ? FailB(e, x) : e;
}

}  // namespace

// The parameterless windows, real and complex.
#define TSM_WINDOW_PAIR(Name, CxName, Kernel)                                      \
  int32_t Name(F64ArrayHdl x) {                                                    \
    return WindowB(x, [](auto* v, int32 n) { return Kernel(v, n); });              \
  }                                                                                \
  int32_t CxName(CxArrayHdl x) {                                                   \
    return WindowB(x, [](auto* v, int32 n) { return Kernel(v, n); });              \
  }

extern "C" {

int32_t AllCosWinH(F64ArrayHdl x, int32_t selector, int32_t normalise) {
  return WindowB(x, [&](auto* v, int32 n) { return SelectorCosineWindow(v, n, selector, normalise != 0); });
}
int32_t CxAllCosWinH(CxArrayHdl x, int32_t selector, int32_t normalise) {
  return WindowB(x, [&](auto* v, int32 n) { return SelectorCosineWindow(v, n, selector, normalise != 0); });
}
int32_t GenCosWinH(F64ArrayHdl x, F64ArrayHdl coefs) { return GenCos(x, coefs, false); }
int32_t CxGenCosWinH(CxArrayHdl x, F64ArrayHdl coefs) { return GenCos(x, coefs, false); }
int32_t ScaledGenCosWinH(F64ArrayHdl x, F64ArrayHdl coefs) { return GenCos(x, coefs, true); }
int32_t ScaledCxGenCosWinH(CxArrayHdl x, F64ArrayHdl coefs) { return GenCos(x, coefs, true); }

TSM_WINDOW_PAIR(BartHannWinH, CxBartHannWinH, BartHannWindow)
TSM_WINDOW_PAIR(BohmanWinH, CxBohmanWinH, BohmanWindow)
TSM_WINDOW_PAIR(ParzenWinH, CxParzenWinH, ParzenWindow)
TSM_WINDOW_PAIR(WelchWinH, CxWelchWinH, WelchWindow)
TSM_WINDOW_PAIR(TriangleWinH, CxTriangleWinH, TriangleWindow)
#undef TSM_WINDOW_PAIR

int32_t TriangleWin(F64ArrayHdl x, int32_t* err) {
  return WindowA(x, err, [](auto* v, int32 n) { return TriangleWindow(v, n); });
}

int32_t CosTaperedH(F64ArrayHdl x, double ratio) {
  return WindowB(x, [=](auto* v, int32 n) { return CosTaperedWindow(v, n, ratio); });
}
int32_t CxCosTaperedH(CxArrayHdl x, double ratio) {
  return WindowB(x, [=](auto* v, int32 n) { return CosTaperedWindow(v, n, ratio); });
}
int32_t CosTapered(F64ArrayHdl x, int32_t* err) {
  return WindowA(x, err, [](auto* v, int32 n) { return CosTaperedWindow(v, n, kCosTaperedRatio); });
}

int32_t DolChebyWinH(F64ArrayHdl x, double ratio, int32_t form) {
  return WindowB(x, [=](auto* v, int32 n) { return DolphChebyshevWindow(v, n, ratio, form != 0); });
}
int32_t CxDolChebyWinH(CxArrayHdl x, double ratio, int32_t form) {
  return WindowB(x, [=](auto* v, int32 n) { return DolphChebyshevWindow(v, n, ratio, form != 0); });
}

int32_t ExpWinH(F64ArrayHdl x, double final_value) {
  return WindowB(x, [=](auto* v, int32 n) { return ExpWindow(v, n, final_value); });
}
int32_t CxExpWinH(CxArrayHdl x, double final_value) {
  return WindowB(x, [=](auto* v, int32 n) { return ExpWindow(v, n, final_value); });
}
int32_t ExpWindCIN(F64ArrayHdl x, double* final_value, int32_t* err) {
  return WindowA(x, err, [=](auto* v, int32 n) { return ExpWindow(v, n, *final_value); });
}

int32_t ForceWinH(F64ArrayHdl x, double duty) {
  return WindowB(x, [=](auto* v, int32 n) { return ForceWindow(v, n, duty); });
}
int32_t CxForceWinH(CxArrayHdl x, double duty) {
  return WindowB(x, [=](auto* v, int32 n) { return ForceWindow(v, n, duty); });
}
int32_t ForceWindCIN(F64ArrayHdl x, double* duty, int32_t* err) {
  return WindowA(x, err, [=](auto* v, int32 n) { return ForceWindow(v, n, *duty); });
}

int32_t GaussWinH(F64ArrayHdl x, double sigma, int32_t form) {
  return WindowB(x, [=](auto* v, int32 n) { return GaussWindow(v, n, sigma, form != 0); });
}
int32_t CxGaussWinH(CxArrayHdl x, double sigma, int32_t form) {
  return WindowB(x, [=](auto* v, int32 n) { return GaussWindow(v, n, sigma, form != 0); });
}

int32_t KaiserH(F64ArrayHdl x, double beta) {
  return WindowB(x, [=](auto* v, int32 n) { return KaiserWindow(v, n, beta); });
}
int32_t CxKaiserH(CxArrayHdl x, double beta) {
  return WindowB(x, [=](auto* v, int32 n) { return KaiserWindow(v, n, beta); });
}
int32_t Kaiser_Bessel(F64ArrayHdl x, double* beta, int32_t* err) {
  return WindowA(x, err, [=](auto* v, int32 n) { return KaiserWindow(v, n, *beta); });
}

int32_t ScaledWinH(F64ArrayHdl x, int32_t selector, double param, WinConsts* consts) {
  return ScaledWin(x, selector, param, consts);
}
int32_t CxScaledWinH(CxArrayHdl x, int32_t selector, double param, WinConsts* consts) {
  return ScaledWin(x, selector, param, consts);
}

int32_t SymmWinH(F64ArrayHdl x, int32_t selector, double param) {
  return WindowB(x, [=](auto* v, int32 n) { return SymmetricWindow(v, n, selector, param); });
}
int32_t CxSymmWinH(CxArrayHdl x, int32_t selector, double param) {
  return WindowB(x, [=](auto* v, int32 n) { return SymmetricWindow(v, n, selector, param); });
}

// The constants are left as they were on failure.
int32_t WinConstByNameH(int32_t n, int32_t selector, double param, WinConsts* consts) {
  return WindowConstsByName(n, selector, param, consts);
}

// A failure leaves NaN in both constants.
int32_t NumWinConstH(F64ArrayHdl w, WinConsts* consts) {
  const ErrorCode e = MeasureWindow(Elems(w), Count(w), consts);
  if (e != TSM_SUCCESS) *consts = WinConsts{kNaN, kNaN};
  return e;
}

}  // extern "C"
