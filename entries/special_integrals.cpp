// Entries of the special functions: integrals and elliptic functions. Form C:
// arguments by value, results through the trailing pointers, no error code.
#include <cmath>

#include "frame/types.h"
#include "tsmath/tsmath.h"
#include "special/dilog.h"
#include "special/elliptic.h"
#include "special/expint.h"
#include "special/fresnel.h"
#include "special/sici.h"
#include "special/common.h"

using namespace tsm;

extern "C" {

void TS_FresnelIntegrals(double x, double* s, double* c) { FresnelIntegrals(x, s, c); }

// Value first, order second, the reverse of the kernel.
void TS_ExpI(double x, int32_t n, double* result) { *result = ExpIntegralN(n, x); }

void TS_SinI(double x, double* result) {
  f64 ci;
  SineCosineIntegrals(x, result, &ci);
}

void TS_CosI(double x, double* result) {
  f64 si;
  SineCosineIntegrals(x, &si, result);
}

void TS_SinhI(double x, double* result) { *result = HyperbolicSineIntegral(x); }

void TS_CoshI(double x, double* result) { *result = HyperbolicCosineIntegral(x); }

// A NaN phi selects the complete integral.
void TS_Elliptic1(double m, double phi, double* result) {
  *result = IsNaNValue(phi) ? EllipticK(m) : EllipticF(phi, m);
}

void TS_Elliptic1_85(double m, double phi, double* result, int32_t mode) {
  *result = mode == 1 ? EllipticK(m) : EllipticF(phi, m);
}

void TS_Elliptic2(double m, double phi, double* result) {
  *result = IsNaNValue(phi) ? EllipticE(m) : EllipticEInc(phi, m);
}

void TS_Elliptic2_85(double m, double phi, double* result, int32_t mode) {
  *result = mode == 1 ? EllipticE(m) : EllipticEInc(phi, m);
}

void TS_EllipticJ(double u, double m, double* sn, double* cn, double* dn, double* phi) {
  f64 ph;
  JacobiElliptic(u, m, sn, cn, dn, &ph);
  if (phi != nullptr) *phi = ph;
}

void TS_Diln(double x, double* result) { *result = Dilogarithm(x); }

}  // extern "C"
