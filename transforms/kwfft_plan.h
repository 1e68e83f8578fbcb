// FFT plans: one cached, reference-counted kwfft_table per length, shared by
// all threads and by real and complex transforms alike.
//
// A length factors greedily over the radix list (kind 0, served by generated
// codelets), then by trial division: primes below 50 outside the list (23,
// 47) are kind 1, served by a generic odd pass over a root table; primes of
// 50 and more are kind 2, served by Rader's algorithm over a nested plan of
// length p-1. Factors are sorted ascending, so the largest is the leaf.
//
// All trigonometric tables come from one recurrence on exp(-i a) in which sin
// is the only function evaluated; its error grows with the table length and
// is the accepted accuracy.
#pragma once

#include <cstddef>
#include <memory>

#include "frame/types.h"

// The plan record is also the library's public opaque plan type.
struct kwfft_table;

namespace tsm {

using ::kwfft_table;

inline constexpr int kKwfftMaxFactors = 20;

// The radix list in its order of trial, closed by -1: 10 first, then the large
// radices, 32, 18, 16 and 14 among them by size.
inline constexpr int32 kwfft_radix_list[] = {10, 43, 41, 37, 32, 31, 29, 19, 18, 17, 16,
                                             14, 13, 11, 9,  8,  7,  5,  4,  3,  2,  -1};

enum KwfftKind : int32 { kKindCodelet = 0, kKindGeneric = 1, kKindRader = 2 };

struct kwfft_stage {
  f64* root_cos = nullptr;  // kind 1: cos(2 pi j / r), j < r
  f64* root_sin = nullptr;  // kind 1: -sin(2 pi j / r)
  f64* tw_cos = nullptr;    // all but the last factor: (r-1)(m-1) twiddles, position-major
  f64* tw_sin = nullptr;
  kwfft_table* rader_plan = nullptr;  // kind 2: plan of p-1, one reference held
  f64* rader_cos = nullptr;           // kind 2: spectrum of the prepared convolution
  f64* rader_sin = nullptr;
  int32* rader_gather = nullptr;  // kind 2: gather[i] = g^-(i-1) mod p
  int32* rader_scatter = nullptr;  // kind 2: scatter[i] = g^(i-1) mod p
};

struct KwfftPasses;  // the four passes of a kind-0 radix (kwfft_passes.h)

}  // namespace tsm

struct kwfft_table {
  tsm::int32 n = 0;
  tsm::int32 refcount = 0;
  tsm::int32 factors[tsm::kKwfftMaxFactors] = {};
  tsm::int32 kinds[tsm::kKwfftMaxFactors] = {};
  tsm::int32 factor_count = 0;
  tsm::kwfft_stage* stages[tsm::kKwfftMaxFactors] = {};
  const tsm::KwfftPasses* passes[tsm::kKwfftMaxFactors] = {};  // kind 0 only
  kwfft_table* prev = nullptr;
  kwfft_table* next = nullptr;
};

namespace tsm {

// Plan of length n with one reference for the caller, or null (n below 1, no
// memory). Takes the cache's mutex.
kwfft_table* CreateKwfftTable(int32 n);
// Drops one reference; the last one frees the plan. Null is a no-op.
void DestroyKwfftTable(kwfft_table* plan);
// One reference to a cached plan, dropped at the end of its scope.
struct KwfftTableRelease {
  void operator()(kwfft_table* plan) const { DestroyKwfftTable(plan); }
};
using KwfftTableReference = std::unique_ptr<kwfft_table, KwfftTableRelease>;
// The same without the mutex, for nested plans built under it.
kwfft_table* kwfft_table_create_locked(int32 n);
void kwfft_table_destroy_locked(kwfft_table* plan);

// Smallest length not below n whose prime factors all lie in 2, 3, 5, 7, 11,
// 13, 17, 19, 29, 31, 37, 41, 43 (23 is not among them). 1 for n below 2;
// 0 when no such length fits in int32.
int32 kwfft_next_smooth_length(int32 n);

// exp(-i k a) for k = 1 .. count into c[k-1], t[k-1] (t holds the negative
// sine), by the recurrence from sin(a/2) and sin(a).
void KwfftTrigTable(f64 a, int32 count, f64* c, f64* t);

// A full turn, as the float64 the tables are built with.
inline constexpr f64 kKwfftTwoPi = 6.283185307179586;

// Number of plans in the cache and the sum of their reference counts (tests).
void KwfftCacheCensus(int32* plans, int32* references);

}  // namespace tsm
