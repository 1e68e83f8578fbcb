// Between a HalfComplex spectrum and a full complex one, with or without the
// zero frequency moved to the middle.
#include <utility>

#include "transforms/kwfft.h"

namespace tsm {
namespace {

// Index of bin k (-(n-1)/2 .. n/2) in the array.
inline int32 Slot(int32 k, int32 n, int32 shift) {
  if (shift != 0) {
    const int32 at = n / 2 + k;
    return at >= n ? at - n : at;  // even n: the Nyquist bin wraps to index 0
  }
  return k >= 0 ? k : n + k;
}

}  // namespace

void kwfft_unpack_halfcomplex(cx* spectrum, int32 n, int32 shift) {
  if (n < 1) return;
  // Pair k, n-k holds (Re X[k], Im X[k]) in its real slots: both are read
  // before either slot is rewritten.
  for (int32 k = 1; k < n - k; ++k) {
    const f64 re = spectrum[k].re, im = spectrum[n - k].re;
    spectrum[k] = cx{re, im};
    spectrum[n - k] = cx{re, -im};
  }
  spectrum[0].im = 0.0;
  if (n % 2 == 0) spectrum[n / 2].im = 0.0;
  if (shift == 0) return;
  // Rotate right by n/2 (three reversals, in place): bin 0 to index n/2.
  auto reverse = [spectrum](int32 a, int32 b) {
    for (--b; a < b; ++a, --b) std::swap(spectrum[a], spectrum[b]);
  };
  reverse(0, n);
  reverse(0, n / 2);
  reverse(n / 2, n);
}

void kwfft_pack_halfcomplex(const cx* spectrum, int32 n, int32 shift, f64* hc) {
  if (n < 1) return;
  hc[0] = spectrum[Slot(0, n, shift)].re;
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {
    const cx v = spectrum[Slot(k, n, shift)];
    hc[k] = v.re;
    hc[n - k] = v.im;
  }
  if (n % 2 == 0) hc[n / 2] = spectrum[Slot(n / 2, n, shift)].re;
}

}  // namespace tsm
