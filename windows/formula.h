// Windows given by a closed formula, periodic form (denominator n). Each is
// symmetric about i = n/2: half is computed into front scratch, mirrored and
// multiplied into x in place. T is f64 or cx. -20003 for n below 1, -20001
// without scratch; n of 1 leaves x alone.
#pragma once

#include "frame/types.h"

namespace tsm {

// 0.62 - 0.48 |i/n - 0.5| + 0.38 cos(2 pi (i/n - 0.5))
template <class T>
ErrorCode BartHannWindow(T* x, int32 n);
// (1 - t) cos(pi t) + sin(pi t) / pi, t = |2i/n - 1|
template <class T>
ErrorCode BohmanWindow(T* x, int32 n);
// h = n/2, d = |i - h|: 1 - 6 (d/h)^2 + 6 (d/h)^3 for d <= h/2, else 2 (1 - d/h)^3
template <class T>
ErrorCode ParzenWindow(T* x, int32 n);
// 1 - ((i - n/2) / (n/2))^2
template <class T>
ErrorCode WelchWindow(T* x, int32 n);
// 1 - |2i/n - 1|
template <class T>
ErrorCode TriangleWindow(T* x, int32 n);

}  // namespace tsm
