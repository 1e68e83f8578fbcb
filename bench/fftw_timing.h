// Pieces shared by the benchmarks that run FFTW beside our transforms.
#pragma once

#include <benchmark/benchmark.h>
#include <fftw3.h>

#include <initializer_list>
#include <vector>

#include "support/random_data.h"

namespace tsmbench {

// Reproducible data: the tests' uniform samples in [-1, 1).
inline std::vector<double> Noise(size_t n, unsigned seed) { return tsmtest::RandomReal(static_cast<int>(n), seed); }

// Times fftw_execute(p) (the plan made outside the timing), then destroys the
// plan and frees the FFTW buffers.
inline void TimeFftwPlan(benchmark::State& state, fftw_plan p, std::initializer_list<void*> buffers) {
  for (auto _ : state) {
    fftw_execute(p);
    benchmark::ClobberMemory();
  }
  fftw_destroy_plan(p);
  for (void* b : buffers) fftw_free(b);
}

}  // namespace tsmbench
