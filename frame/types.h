// Scalar types and shared constants of the kernels.
#pragma once

#include <bit>
#include <cstdint>

#include "tsmath/tsmath_codes.h"

namespace tsm {

using f64 = double;
using int32 = std::int32_t;
using uint32 = std::uint32_t;
using ::ErrorCode;

// Complex element: real part, then imaginary part (the public `cx`).
struct cx {
  f64 re;
  f64 im;
};

// The NaN that stands for a result that could not be computed.
inline constexpr f64 kNaN = std::bit_cast<f64>(std::uint64_t{0x7FF8000000000000});
// The largest float64.
inline constexpr f64 kMaxF64 = 1.7976931348623157e308;
// Machine epsilon as used in every tolerance formula.
inline constexpr f64 kEps = 2.220446049250313e-16;

}  // namespace tsm
