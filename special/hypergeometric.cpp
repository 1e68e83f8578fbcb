// Asymptotic hypergeometric series 2F0(a, b; ; z).
//
// This is the auxiliary series of the large-argument forms of 1F1 and of the
// parabolic cylinder functions. Its terms first decrease and then, unless a or
// b is a non-positive integer, grow without bound: the sum stops at the first
// term below MACHEP of the sum, and a run that reaches 1e10 in a term, or
// exhausts its term budget, is reported as failed so that the caller takes
// another method.
#include "special/hypergeometric.h"

#include <cmath>

#include "special/common.h"

namespace tsm {

bool Hypergeometric2F0(f64 a, f64 b, f64 z, int32 maxTerms, f64* sum, f64* loss) {
  constexpr f64 kCut = 1e10;
  f64 t = 1, s = 1, biggest = 1;
  bool done = false;
  for (int32 k = 0; k < maxTerms; ++k) {
    t *= (a + k) * (b + k) * z / (k + 1);
    s += t;
    biggest = std::fmax(biggest, std::fabs(t));
    if (std::fabs(t) <= kMachEp * std::fabs(s)) {
      done = true;
      break;
    }
    if (std::fabs(t) > kCut) break;
  }
  *sum = s;
  *loss = s == 0 ? kCut : biggest / std::fabs(s);
  return done;
}

}  // namespace tsm
