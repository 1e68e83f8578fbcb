// The random source and the noise distributions drawn from it.
//
// The source is a Wichmann-Hill generator of three multiplicative congruential
// words; it keeps no state of its own: the caller's NoiseState holds the words,
// and passing the same record again continues one stream. The int32 products
// wrap as two's complement (formed in 64 bits and reduced), and the
// remainders take the sign of the dividend, so a word made negative by a large
// seed stays negative and cycles like a positive one.
//
// A seed at or above 0 goes through NoiseSeed (0 changes nothing), a negative
// one continues the stream. A record of zeros that is not reseeded gives a
// constant stream of zero uniforms; the rejection methods could never accept
// from it, so on that stuck source they give a fixed value instead (see each).
// Null records are taken as a record of zeros local to the call.
#pragma once

#include "frame/types.h"
#include "tsmath/tsmath.h"

namespace tsm {

// One step of the three words; the fractional part (by subtracting the floor)
// of s1/30269 + s2/30307 + s3/30323, each quotient taken as a product with the
// float64 reciprocal.
f64 UniformNext(int32& s1, int32& s2, int32& s3);
// One step; the fractional part found by truncation, times 32768, truncated.
int32 UniformInt15(int32& s1, int32& s2, int32& s3);
// s1 := seed, s2 := (seed 8191) and 0x3FFF, s3 := (s2 8191) and 0x3FFF; a
// seed of 0 changes nothing.
void NoiseSeed(int32 seed, int32& s1, int32& s2, int32& s3);

// The caller's words in a local copy for one call, written back at its end.
class NoiseSource {
 public:
  // Seeds when seed is at or above 0.
  NoiseSource(NoiseState* state, int32 seed);
  ~NoiseSource();
  NoiseSource(const NoiseSource&) = delete;
  NoiseSource& operator=(const NoiseSource&) = delete;

  f64 Uniform() { return UniformNext(s1_, s2_, s3_); }
  int32 Int15() { return UniformInt15(s1_, s2_, s3_); }
  // All three words 0: every uniform is 0 from here on.
  bool Stuck() const { return s1_ == 0 && s2_ == 0 && s3_ == 0; }

 private:
  NoiseState* state_;
  int32 s1_ = 0, s2_ = 0, s3_ = 0;
};

// (u - 0.5) 2 amp.
ErrorCode WhiteNoise(f64* y, int32 n, f64 amp, int32 seed, NoiseState* state);

// sd times standard normal deviates by the polar method, in pairs whose second
// member is kept in the caller's spare (so an odd length carries it into the
// next call). Only a seed above 0 reseeds, and it clears the spare. On a stuck
// source each new pair is (0, 0).
ErrorCode GaussNoise(f64* y, int32 n, f64 sd, int32 seed, NoiseState* state, GaussSpare* spare);

// Gamma deviates of integer order (order >= 1): -ln of a product of order
// uniforms below order 6, rejection under a Cauchy-type hull from 6 on. On a
// stuck source the rejection gives order - 1, the mode.
ErrorCode GammaNoise(f64* y, int32 n, int32 order, int32 seed, NoiseState* state);

// Poisson deviates (0 < mean, finite): counting products of uniforms below
// mean 12, rejection under a Lorentzian hull from 12 on.
ErrorCode PoissonNoise(f64* y, int32 n, f64 mean, int32 seed, NoiseState* state);

// Binomial deviates (trials >= 0, 0 <= p <= 1), drawn for min(p, 1-p) and
// mirrored: direct counting below 25 trials, a Poisson-type count when the
// mean is below 1, rejection otherwise with its set-up kept in the cache.
ErrorCode BinomialNoise(uint32* y, int32 n, int32 trials, f64 p, int32 seed, NoiseState* state,
                        BinomialCache* cache);

// n samples of flat magnitude n amp / 2 in bins 1 to (n-1)/2 and their mirror
// images, phases from UniformInt15 taken as radians, bins 0 and n/2 zero,
// through an inverse complex FFT; the real part goes to y.
ErrorCode PeriodicNoise(f64* y, int32 n, f64 amp, int32 seed, NoiseState* state);

}  // namespace tsm
