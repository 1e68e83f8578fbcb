// The Wichmann-Hill source, uniform and Gaussian noise, and periodic noise of
// flat magnitude.
#include "generate/noise.h"

#include <cmath>
#include <cstdint>

#include "frame/workspace.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

constexpr f64 kRecip1 = 3.3037100664045725e-05;  // 1/30269
constexpr f64 kRecip2 = 3.2995677566238825e-05;  // 1/30307
constexpr f64 kRecip3 = 3.297826732183491e-05;   // 1/30323

// a b as int32 with two's complement wrap.
int32 WrapMul(std::int64_t a, std::int64_t b) { return static_cast<int32>(static_cast<std::uint32_t>(a * b)); }

f64 StepSum(int32& s1, int32& s2, int32& s3) {
  s1 = WrapMul(171, s1) % 30269;
  s2 = WrapMul(172, s2) % 30307;
  s3 = WrapMul(170, s3) % 30323;
  return s1 * kRecip1 + s2 * kRecip2 + s3 * kRecip3;
}

}  // namespace

f64 UniformNext(int32& s1, int32& s2, int32& s3) {
  const f64 sum = StepSum(s1, s2, s3);
  return sum - std::floor(sum);
}

int32 UniformInt15(int32& s1, int32& s2, int32& s3) {
  const f64 sum = StepSum(s1, s2, s3);
  return static_cast<int32>((sum - std::trunc(sum)) * 32768.0);
}

void NoiseSeed(int32 seed, int32& s1, int32& s2, int32& s3) {
  if (seed == 0) return;
  s1 = seed;
  s2 = WrapMul(seed, 8191) & 0x3FFF;
  s3 = WrapMul(s2, 8191) & 0x3FFF;
}

NoiseSource::NoiseSource(NoiseState* state, int32 seed) : state_(state) {
  if (state_ != nullptr) {
    s1_ = state_->s1;
    s2_ = state_->s2;
    s3_ = state_->s3;
  }
  if (seed >= 0) NoiseSeed(seed, s1_, s2_, s3_);
}

NoiseSource::~NoiseSource() {
  if (state_ == nullptr) return;
  state_->s1 = s1_;
  state_->s2 = s2_;
  state_->s3 = s3_;
}

ErrorCode WhiteNoise(f64* y, int32 n, f64 amp, int32 seed, NoiseState* state) {
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed);
  for (int32 i = 0; i < n; ++i) y[i] = (src.Uniform() - 0.5) * (amp + amp);
  return TSM_SUCCESS;
}

ErrorCode GaussNoise(f64* y, int32 n, f64 sd, int32 seed, NoiseState* state, GaussSpare* spare) {
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed > 0 ? seed : -1);
  const bool keep = spare != nullptr && seed <= 0;
  int32 valid = keep ? spare->valid : 0;
  f64 kept = keep ? spare->value : 0.0;
  for (int32 i = 0; i < n; ++i) {
    if (valid == 0) {
      f64 a = 0, b = 0, r = 0;
      while (!src.Stuck()) {
        a = 2.0 * src.Uniform() - 1.0;
        b = 2.0 * src.Uniform() - 1.0;
        r = a * a + b * b;
        if (r < 1.0 && r > 0.0) break;
      }
      const f64 f = r > 0.0 ? std::sqrt(-2.0 * std::log(r) / r) : 0.0;
      kept = a * f;
      y[i] = b * f * sd;
    } else {
      y[i] = kept * sd;
    }
    valid = valid == 0 ? 1 : 0;
  }
  if (spare != nullptr) {
    spare->valid = valid;
    spare->value = kept;
  }
  return TSM_SUCCESS;
}

ErrorCode PeriodicNoise(f64* y, int32 n, f64 amp, int32 seed, NoiseState* state) {
  if (n < 1) return TSM_ERR_EMPTY;
  Scratch<f64> work;  // spectrum re, im, and the imaginary part of the result
  if (const ErrorCode e = work.Allocate(3 * std::int64_t{n}); e != TSM_SUCCESS) return e;
  f64* re = work.get();
  f64* im = re + n;
  NoiseSource src(state, seed);
  const int32 half = n % 2 == 0 ? n / 2 - 1 : (n - 1) / 2;
  for (int32 k = 0; k < 2 * n; ++k) re[k] = 0.0;
  const f64 mag = n * amp * 0.5;
  for (int32 k = 1; k <= half; ++k) {
    const f64 angle = src.Int15();  // radians as it stands
    re[k] = mag * std::cos(angle);
    im[k] = mag * std::sin(angle);
    re[n - k] = re[k];
    im[n - k] = -im[k];
  }
  const KwfftTableReference plan(CreateKwfftTable(n));
  if (plan == nullptr) return TSM_ERR_NO_MEMORY;
  return kwfft_complex_inverse(plan.get(), re, im, y, im + n, 1, 1, n);
}

}  // namespace tsm
