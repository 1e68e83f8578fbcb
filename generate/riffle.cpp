#include "generate/riffle.h"

#include <cstring>

#include "generate/noise.h"

namespace tsm {
namespace {

// Elements may stand misaligned in a host block: swap their bytes.
template <class T>
void SwapAt(T* a, int32 i, int32 j) {
  T t;
  std::memcpy(&t, a + i, sizeof t);
  std::memcpy(a + i, a + j, sizeof t);
  std::memcpy(a + j, &t, sizeof t);
}

// floor(u m), kept below m.
int32 Draw(NoiseSource& src, int32 m) {
  const int32 j = static_cast<int32>(src.Uniform() * m);
  return j < m ? j : m - 1;
}

}  // namespace

template <class T>
ErrorCode Riffle(T* data, int32* indices, int32 n, int32 seed, NoiseState* state, uint32 mode) {
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed);
  for (int32 i = 0; i < n; ++i) std::memcpy(indices + i, &i, sizeof i);
  const auto swap = [&](int32 i, int32 j) {
    if (data != nullptr) SwapAt(data, i, j);
    SwapAt(indices, i, j);
  };
  if (mode == 0) {
    for (int32 i = 0; i < n; ++i) swap(i, Draw(src, n));
  } else {
    for (int32 i = n - 1; i >= 1; --i) swap(i, Draw(src, i + 1));
  }
  return TSM_SUCCESS;
}

template ErrorCode Riffle(f64*, int32*, int32, int32, NoiseState*, uint32);
template ErrorCode Riffle(cx*, int32*, int32, int32, NoiseState*, uint32);
template ErrorCode Riffle(int32*, int32*, int32, int32, NoiseState*, uint32);

}  // namespace tsm
