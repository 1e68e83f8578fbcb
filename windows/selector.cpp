#include "windows/selector.h"

#include "windows/cosine_sum.h"
#include "windows/formula.h"
#include "windows/special_windows.h"

namespace tsm {
namespace {

// Coefficients as the window definitions quote them, every digit kept.
constexpr f64 kRectangular[] = {1.0};
constexpr f64 kHanning[] = {0.5, 0.5};
constexpr f64 kHamming[] = {0.54, 0.46};
constexpr f64 kBlackmanHarris3[] = {0.42323, 0.49755, 0.07922};
constexpr f64 kExactBlackman[] = {0.4265907136715391, 0.4965606190885641, 0.07684866723989682};
constexpr f64 kBlackman[] = {0.42, 0.5, 0.08};
constexpr f64 kFlatTop[] = {0.215578948, 0.41663158, 0.277263158, 0.083578947, 0.006947368};
constexpr f64 kBlackmanHarris4[] = {0.35875, 0.48829, 0.14128, 0.01168};
constexpr f64 kBlackmanHarris7[] = {0.27105140069342415,  0.43329793923448606,   0.21812299954311062,
                                    0.0659254463880309,   0.010811742098372268,  0.0007765848252250934,
                                    1.3887217350903198e-05};
constexpr f64 kLowSideLobe[] = {0.323215218, 0.471492057, 0.17553428, 0.028497078, 0.001261367};
constexpr f64 kBlackmanNuttall[] = {0.3635819, 0.4891775, 0.1365995, 0.0106411};

template <std::size_t M>
constexpr CosineCoefficients Coefs(const f64 (&a)[M]) {
  return {a, static_cast<int32>(M)};
}

constexpr CosineCoefficients kCosineSums[] = {
    Coefs(kRectangular),     Coefs(kHanning),   Coefs(kHamming),  Coefs(kBlackmanHarris3),
    Coefs(kExactBlackman),   Coefs(kBlackman),  Coefs(kFlatTop),  Coefs(kBlackmanHarris4),
    Coefs(kBlackmanHarris7), Coefs(kLowSideLobe), {nullptr, 0},   Coefs(kBlackmanNuttall),
};

struct TabledConsts {
  int32 selector;
  f64 enbw, cg;
};

// The cg of exact Blackman stands to 11 digits while its a[0] has more; the
// table keeps both as defined.
constexpr TabledConsts kConstTable[] = {
    {0, 1.0, 1.0},
    {1, 1.5, 0.5},
    {2, 1.362826, 0.54},
    {3, 1.708538, 0.42323},
    {4, 1.693699, 0.42659071367},
    {5, 1.726757, 0.42},
    {6, 3.770246506303, 0.215578948},
    {7, 2.004353, 0.35875},
    {8, 2.631905, 0.27105140069342415},
    {9, 2.215350782519, 0.323215218},
    {11, 1.9761117, 0.3635819},
    {31, 1.45584787, 0.5},
    {32, 1.78574087544, 0.40528473457},
    {33, 1.91746031746, 0.375},
    {34, 1.2, 0.66666667},
};

}  // namespace

CosineCoefficients CosineSumCoefficients(int32 selector) {
  constexpr int32 count = static_cast<int32>(sizeof kCosineSums / sizeof kCosineSums[0]);
  if (selector < 0 || selector >= count) return {nullptr, 0};
  return kCosineSums[selector];
}

ErrorCode WindowConstTable(int32 selector, WinConsts* consts) {
  if (selector > kWinWelch) return TSM_ERR_BAD_SELECTOR;
  for (const TabledConsts& t : kConstTable)
    if (t.selector == selector) {
      consts->enbw = t.enbw;
      consts->cg = t.cg;
      return TSM_SUCCESS;
    }
  return TSM_ERR_BAD_SELECTOR;
}

ErrorCode MeasureWindow(const f64* w, int32 n, WinConsts* consts) {
  if (n < 1) return TSM_ERR_EMPTY;
  f64 s1 = 0, s2 = 0;
  for (int32 i = 0; i < n; ++i) {
    s1 += w[i];
    s2 += w[i] * w[i];
  }
  consts->cg = s1 / n;
  consts->enbw = s2 * n / (s1 * s1);
  return TSM_SUCCESS;
}

ErrorCode FormulaWindowBySelector(f64* x, int32 n, int32 selector, f64 param) {
  switch (selector) {
    case kWinTriangle: return TriangleWindow(x, n);
    case kWinBartlettHann: return BartHannWindow(x, n);
    case kWinBohman: return BohmanWindow(x, n);
    case kWinParzen: return ParzenWindow(x, n);
    case kWinWelch: return WelchWindow(x, n);
    case kWinKaiser: return KaiserWindow(x, n, param);
    case kWinDolphChebyshev: return DolphChebyshevWindow(x, n, param, false);
    case kWinGaussian: return GaussWindow(x, n, param, false);
    default: return TSM_ERR_BAD_SELECTOR;
  }
}

}  // namespace tsm
