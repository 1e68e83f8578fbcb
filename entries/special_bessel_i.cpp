// Entries of the special functions: Bessel I of real order and the parabolic
// cylinder function. Form C: arguments by value, result through the trailing
// pointer, no error code.
#include "frame/types.h"
#include "tsmath/tsmath.h"
#include "special/bessel_i.h"
#include "special/parabolic_cylinder.h"

using namespace tsm;

extern "C" {

void TS_BesselIr(double v, double x, double* result) { *result = BesselI(v, x); }

// Value first, order second, the reverse of the kernel.
void TS_ParabolicCylinder(double x, double v, double* result) { *result = ParabolicCylinderD(v, x); }

}  // extern "C"
