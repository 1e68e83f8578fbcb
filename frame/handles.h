// Access to host blocks through their handles. A handle's block may move at
// every resize, so these helpers dereference the handle each time and nothing
// keeps a pointer into a block across a resize. Element pointers are not
// 8-byte aligned (float64 data stands at offset 4 of a 1-D block).
#pragma once

#include <cstring>

#include "frame/types.h"
#include "tsmath/tsmath.h"

namespace tsm {

template <class Block>
struct BlockTraits;

template <class E, int32 TypeCode, int32 Dims>
struct BlockOf {
  using Elem = E;
  static constexpr int32 kTypeCode = TypeCode;
  static constexpr int32 kDims = Dims;
};

template <> struct BlockTraits<F64Array> : BlockOf<f64, TSM_TYPE_F64, 1> {};
template <> struct BlockTraits<F32Array> : BlockOf<float, TSM_TYPE_F32, 1> {};
template <> struct BlockTraits<I32Array> : BlockOf<int32, TSM_TYPE_I32, 1> {};
template <> struct BlockTraits<U8Array> : BlockOf<std::uint8_t, TSM_TYPE_U8, 1> {};
template <> struct BlockTraits<U32Array> : BlockOf<uint32, TSM_TYPE_U32, 1> {};
template <> struct BlockTraits<CxArray> : BlockOf<cx, TSM_TYPE_CX128, 1> {};
template <> struct BlockTraits<Matrix> : BlockOf<f64, TSM_TYPE_F64, 2> {};
template <> struct BlockTraits<CxMatrix> : BlockOf<cx, TSM_TYPE_CX128, 2> {};
// Input only: never resized by the library.
template <> struct BlockTraits<GenHistIntervalArray> : BlockOf<GenHistInterval, 0, 1> {};

template <class Block>
using ElemOf = typename BlockTraits<Block>::Elem;

template <class Block>
constexpr std::size_t HeaderBytes() {
  return sizeof(int32) * BlockTraits<Block>::kDims;
}

// Dimension field d of the block (count, or rows then cols).
template <class Block>
int32 Dim(Block** h, int d = 0) {
  int32 v;
  std::memcpy(&v, reinterpret_cast<const char*>(*h) + sizeof(int32) * d, sizeof v);
  return v;
}

template <class Block>
int32 Count(Block** h) {
  static_assert(BlockTraits<Block>::kDims == 1);
  return Dim(h);
}

template <class Block>
void SetDim(Block** h, int d, int32 v) {
  std::memcpy(reinterpret_cast<char*>(*h) + sizeof(int32) * d, &v, sizeof v);
}

template <class Block>
ElemOf<Block>* Elems(Block** h) {
  return reinterpret_cast<ElemOf<Block>*>(reinterpret_cast<char*>(*h) + HeaderBytes<Block>());
}

}  // namespace tsm
