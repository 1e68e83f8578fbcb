// Entries of the Bessel functions of the first and second kind. Form C:
// arguments by value, the result through the trailing pointer.
#include "frame/types.h"
#include "tsmath/tsmath.h"
#include "special/bessel_jy.h"

using namespace tsm;

extern "C" {

void TS_BesselJr(double v, double x, double* result) { *result = BesselJ(v, x); }

void TS_BesselYr(double v, double x, double* result) { *result = BesselY(v, x); }

void TS_BesselJs(int32_t n, double x, double* result) { *result = SphericalBesselJ(n, x); }

void TS_BesselYs(int32_t n, double x, double* result) { *result = SphericalBesselY(n, x); }

}  // extern "C"
