#include "special/common.h"

#include <cmath>

namespace tsm {

// Out of line on purpose: the one place where a build may log the kernels'
// domain, singularity and overflow returns.
void MathErrorHook(int32, int32) {}

void SinCosPi(f64 r, f64* s, f64* c) {
  constexpr f64 kPi = 3.141592653589793;
  const f64 q = std::nearbyint(2 * r);  // quarter turns
  const f64 f = r - q / 2;               // exact, |f| <= 1/4
  const f64 sf = std::sin(kPi * f), cf = std::cos(kPi * f);
  // fmod keeps the sign of q; & 3 then gives q mod 4 for either sign
  switch (static_cast<int>(std::fmod(q, 4.0)) & 3) {
    case 0: *s = sf; *c = cf; break;
    case 1: *s = cf; *c = -sf; break;
    case 2: *s = -sf; *c = -cf; break;
    default: *s = -cf; *c = sf; break;
  }
}

}  // namespace tsm
