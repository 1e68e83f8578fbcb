// The window selector: one int32 names every window. Cosine sums (0 to 9, 11)
// carry their coefficients and tabled constants; formula windows (30 to 34)
// and parametric ones (60 Kaiser, 61 Dolph-Chebyshev, 62 Gaussian) are made
// by their kernels and measured.
#pragma once

#include "frame/types.h"
#include "tsmath/tsmath.h"

namespace tsm {

enum WindowSelector : int32 {
  kWinRectangular = 0,
  kWinHanning = 1,
  kWinBlackmanNuttall = 11,
  kWinTriangle = 30,
  kWinBartlettHann = 31,
  kWinBohman = 32,
  kWinParzen = 33,
  kWinWelch = 34,
  kWinKaiser = 60,
  kWinDolphChebyshev = 61,
  kWinGaussian = 62,
};

struct CosineCoefficients {
  const f64* a;  // null for a selector that is no cosine sum
  int32 m;
};

// The coefficients a[0], a[1], ... of a cosine-sum selector.
CosineCoefficients CosineSumCoefficients(int32 selector);

// The tabled equivalent noise bandwidth and coherent gain of selectors 0 to 9,
// 11 and 31 to 34; -20061 for every other selector.
ErrorCode WindowConstTable(int32 selector, WinConsts* consts);

// Coherent gain sum(w)/n and equivalent noise bandwidth n sum(w^2)/sum(w)^2 of
// a window array; -20003 for n below 1.
ErrorCode MeasureWindow(const f64* w, int32 n, WinConsts* consts);

// Applies the periodic window of selector 30 to 34 or 60 to 62 to w, with
// `param` as the parameter of the last three. -20061 for other selectors.
ErrorCode FormulaWindowBySelector(f64* w, int32 n, int32 selector, f64 param);

}  // namespace tsm
