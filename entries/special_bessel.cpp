// Entries of the special functions: Bessel family. Form C: arguments by
// value, results through the trailing pointers, no error code.
#include "frame/types.h"
#include "tsmath/tsmath.h"
#include "special/airy.h"

using namespace tsm;

extern "C" {

void TS_Airy(double x, double* ai, double* aip, double* bi, double* bip) { AiryFunctions(x, ai, aip, bi, bip); }

}  // extern "C"
