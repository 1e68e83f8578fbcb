#include "special/common.h"

#include <cstdint>
#include <cstring>

namespace tsm {
namespace {

constexpr std::uint64_t kExponentMask = 0x7FF0000000000000ull;
constexpr std::uint64_t kMantissaMask = 0x000FFFFFFFFFFFFFull;

std::uint64_t Bits(f64 x) {
  std::uint64_t b;
  std::memcpy(&b, &x, sizeof b);
  return b;
}

}  // namespace

void MathErrorHook(int32, int32) {}

bool IsNaNValue(f64 x) {
  const std::uint64_t b = Bits(x);
  return (b & kExponentMask) == kExponentMask && (b & kMantissaMask) != 0;
}

bool IsFiniteValue(f64 x) { return (Bits(x) & kExponentMask) != kExponentMask; }

int32 InfinitySign(f64 x) {
  if (IsFiniteValue(x) || IsNaNValue(x)) return 0;
  return x > 0 ? 1 : -1;
}

f64 PolyEval(f64 x, const f64* coef, int32 n) {
  f64 y = coef[0];
  for (int32 i = 1; i <= n; ++i) y = y * x + coef[i];
  return y;
}

f64 PolyEval1(f64 x, const f64* coef, int32 n) {
  f64 y = x + coef[0];
  for (int32 i = 1; i < n; ++i) y = y * x + coef[i];
  return y;
}

}  // namespace tsm
