#include "frame/validity.h"

#include <cmath>

namespace tsm {
namespace {

// The negative bound is -1.7976931348623e308 rounded to 14 digits, bit
// pattern 0xFFEFFFFFFFFFFFB0, and is tested as a range; the positive bound is
// the largest float64 itself and is tested for equality.
constexpr f64 kNegativeBound = std::bit_cast<f64>(std::uint64_t{0xFFEFFFFFFFFFFFB0});

bool Refused(f64 v) {
  return !std::isfinite(v) || v == kMaxF64 || !(v > kNegativeBound);
}

}  // namespace

int32 HasNonFiniteValue(const f64* a, int32 n) {
  for (int32 i = 0; i < n; ++i)
    if (Refused(a[i])) return 1;
  return 0;
}

int32 CxHasNonFiniteValue(const cx* a, int32 n) {
  for (int32 i = 0; i < n; ++i)
    if (Refused(a[i].re) || Refused(a[i].im)) return 1;
  return 0;
}

}  // namespace tsm
