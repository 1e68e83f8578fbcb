// Kelvin functions ber, bei, ker, kei of integer order.
#pragma once

#include "frame/types.h"

namespace tsm {

// ber_n(x) (real true) or bei_n(x) (real false) by the power series.
f64 KelvinSeries(int32 n, f64 x, bool real);
// ber_n(x) and bei_n(x).
void KelvinI(int32 n, f64 x, f64* ber, f64* bei);
// ker_n(x) and kei_n(x), x > 0.
void KelvinK(int32 n, f64 x, f64* ker, f64* kei);

}  // namespace tsm
