// Shared pieces of the special-function kernels: machine constants, the
// classification helpers, polynomial evaluation and the error hook.
//
// Kernels report a bad argument only through the value they return (NaN, an
// infinity or a limit); just before such a return they call MathErrorHook
// with the kind of error, the one place where a build may log them.
#pragma once

#include <cmath>
#include <cstdint>
#include <cstring>

#include "frame/types.h"

namespace tsm {

inline constexpr f64 kMachEp = 2.220446049250313e-16;
inline constexpr f64 kMaxLog = 709.782712893384;
inline constexpr f64 kBig = 144115188075855872.0;  // 2^57
inline constexpr f64 kBigInv = 6.938893903907228e-18;
inline constexpr f64 kEuler = 0.5772156649015329;

enum MathErrorType : int32 { kMathDomain = 0, kMathSingularity = 1, kMathOverflow = 2 };

// Called by every domain, singularity and overflow path; does nothing.
void MathErrorHook(int32 kind, int32 type);

// sin(pi r) and cos(pi r), reduced exactly: exact at the multiples of 1/2
// and relatively accurate near them.
void SinCosPi(f64 r, f64* s, f64* c);

namespace detail {
inline constexpr std::uint64_t kExponentMask = 0x7FF0000000000000ull;
inline constexpr std::uint64_t kMantissaMask = 0x000FFFFFFFFFFFFFull;
inline std::uint64_t Bits(f64 x) {
  std::uint64_t b;
  std::memcpy(&b, &x, sizeof b);
  return b;
}
}  // namespace detail

// The helpers below are inline: they sit in every kernel's hot path, and
// with a constant degree the compiler unrolls the polynomials.

// True for any NaN, signalling or quiet.
inline bool IsNaNValue(f64 x) {
  const std::uint64_t b = detail::Bits(x);
  return (b & detail::kExponentMask) == detail::kExponentMask && (b & detail::kMantissaMask) != 0;
}
// True unless the exponent field is all ones.
inline bool IsFiniteValue(f64 x) { return (detail::Bits(x) & detail::kExponentMask) != detail::kExponentMask; }
// 0 for a finite value or NaN, +1 for plus infinity, -1 for minus infinity.
inline int32 InfinitySign(f64 x) {
  if (IsFiniteValue(x) || IsNaNValue(x)) return 0;
  return x > 0 ? 1 : -1;
}

// coef[0] x^n + ... + coef[n] by Horner's rule (n + 1 coefficients).
inline f64 PolyEval(f64 x, const f64* coef, int32 n) {
  f64 y = coef[0];
  for (int32 i = 1; i <= n; ++i) y = y * x + coef[i];
  return y;
}
// The same with an implied leading coefficient 1 and n stored coefficients:
// x^n + coef[0] x^(n-1) + ... + coef[n-1].
inline f64 PolyEval1(f64 x, const f64* coef, int32 n) {
  f64 y = x + coef[0];
  for (int32 i = 1; i < n; ++i) y = y * x + coef[i];
  return y;
}

// Two pairs of convergents of a continued fraction, p_k = b p_(k-1) + a p_(k-2)
// and likewise q_k, rescaled by 1/big when |p_k| exceeds big. T is the
// working precision (long double where many rounds accumulate rounding).
template <typename T>
struct ConvergentsOf {
  T pkm2, pkm1, qkm2, qkm1;
  T value;  // the last ratio p/q

  // Takes one more term; returns the relative change of the value, or 1 when
  // the new denominator is 0 (the value then stays).
  f64 Step(T a, T b) {
    const T pk = pkm1 * b + pkm2 * a;
    const T qk = qkm1 * b + qkm2 * a;
    f64 change = 1.0;
    if (qk != 0) {
      const T r = pk / qk;
      change = static_cast<f64>(std::fabs((value - r) / r));
      value = r;
    }
    pkm2 = pkm1;
    pkm1 = pk;
    qkm2 = qkm1;
    qkm1 = qk;
    if (std::fabs(pk) > kBig) {
      pkm2 *= kBigInv;
      pkm1 *= kBigInv;
      qkm2 *= kBigInv;
      qkm1 *= kBigInv;
    }
    return change;
  }
};
using Convergents = ConvergentsOf<f64>;

// The code every kernel passes to the hook.
inline constexpr int32 kMathKernel = 1;

// Calls the hook with `type` and returns `value`: the shape of every error
// return of the kernels.
inline f64 MathError(int32 type, f64 value) {
  MathErrorHook(kMathKernel, type);
  return value;
}

}  // namespace tsm
