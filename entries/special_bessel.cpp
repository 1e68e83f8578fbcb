// Entries of the special functions: Bessel family. Form C: arguments by
// value, results through the trailing pointers, no error code.
#include "frame/types.h"
#include "tsmath/tsmath.h"
#include "special/airy.h"
#include "special/bessel_ik.h"
#include "special/kelvin.h"
#include "special/struve.h"

using namespace tsm;

extern "C" {

void TS_Airy(double x, double* ai, double* aip, double* bi, double* bip) { AiryFunctions(x, ai, aip, bi, bip); }

void TS_BesselKn(int32_t n, double x, double* result) { *result = BesselK(n, x); }

// Value first, order second, the reverse of the kernels.
void TS_KelvinI(double x, int32_t n, double* ber, double* bei) { KelvinI(n, x, ber, bei); }

void TS_KelvinK(double x, int32_t n, double* ker, double* kei) { KelvinK(n, x, ker, kei); }

void TS_Struve(double x, double v, double* result) { *result = StruveH(v, x); }

}  // extern "C"
