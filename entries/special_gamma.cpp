// Entries of the gamma, beta, error-function and zeta kernels. Each writes the
// kernel's value through its last pointer; a bad argument shows only in the
// value. The unsuffixed TS_Gamma and TS_Beta select the complete function by a
// NaN in their last numeric argument, their _85 revisions by mode 1.
#include "special/beta.h"
#include "special/common.h"
#include "special/erf.h"
#include "special/gamma.h"
#include "special/zeta.h"
#include "tsmath/tsmath.h"

using namespace tsm;

extern "C" {

void TS_Fact(int32_t n, double* out) { *out = Factorial(n); }
void TS_LnFact(int32_t n, double* out) { *out = LogFactorial(n); }

void TS_Gamma(double a, double x, double* out) { *out = IsNaNValue(x) ? GammaFn(a) : IncompleteGamma(a, x); }
void TS_Gamma_85(double a, double x, double* out, int32_t mode) {
  *out = mode == 1 ? GammaFn(a) : IncompleteGamma(a, x);
}
void TS_GammaC(double a, double x, double* out) { *out = IncompleteGammaC(a, x); }
void TS_LnGamma(double x, double* out) { *out = LogGamma(x); }
void TS_Psi(double x, double* out) { *out = Digamma(x); }
void TS_Stirling(double x, double* out) { *out = StirlingGamma(x); }

void TS_Beta(double a, double b, double x, double* out) {
  *out = IsNaNValue(x) ? BetaFn(a, b) : IncompleteBeta(a, b, x);
}
void TS_Beta_85(double a, double b, double x, double* out, int32_t mode) {
  *out = mode == 1 ? BetaFn(a, b) : IncompleteBeta(a, b, x);
}

void TS_Erf(double x, double* out) { *out = ErrorFn(x); }
void TS_ErfC(double x, double* out) { *out = ErrorFnC(x); }
void TS_Dawson(double x, double* out) { *out = DawsonIntegral(x); }
void TS_Zeta(double x, double* out) { *out = RiemannZeta(x); }

}  // extern "C"
