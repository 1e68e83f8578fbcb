// The repeated shapes of entry frames: size an output through the host and
// write its dimension fields, shrink outputs to 0 after a failure, report a
// code in the error out-argument (form A) or as the result (form B).
//
// Which kernel results count as failure differs by entry: some test for
// non-zero, others for negative so that a positive warning passes with the
// results left in place.
#pragma once

#include "frame/handles.h"
#include "frame/host.h"

namespace tsm {

enum class FailOn { kNonZero, kNegative };

constexpr bool Failed(ErrorCode code, FailOn test) {
  return test == FailOn::kNonZero ? code != 0 : code < 0;
}

// Resizes a 1-D output to n elements and writes its count; the host's result,
// 0 on success. The handle variable is passed on to the host by address.
template <class Block>
int32 ResizeOutput(Block**& h, int32 n) {
  static_assert(BlockTraits<Block>::kDims == 1);
  const int32 r = HostNumericArrayResize(BlockTraits<Block>::kTypeCode, 1, &h, n);
  if (r == 0) SetDim(h, 0, n);
  return r;
}

// Resizes a 2-D output and writes rows and cols.
template <class Block>
int32 ResizeOutput(Block**& h, int32 rows, int32 cols) {
  static_assert(BlockTraits<Block>::kDims == 2);
  const int32 r = HostNumericArrayResize(BlockTraits<Block>::kTypeCode, 2, &h, rows * cols);
  if (r == 0) {
    SetDim(h, 0, rows);
    SetDim(h, 1, cols);
  }
  return r;
}

// Shrinks an output to 0 elements and writes 0 to its dimension fields; the
// host's result is ignored: the fields are written in any case. A few entries
// shrink with another type code than their block's, hence the override.
template <class Block>
void EmptyOutput(Block**& h, int32 typeCode = BlockTraits<Block>::kTypeCode) {
  HostNumericArrayResize(typeCode, BlockTraits<Block>::kDims, &h, 0);
  if (h != nullptr && *h != nullptr)
    for (int d = 0; d < BlockTraits<Block>::kDims; ++d) SetDim(h, d, 0);
}

template <class... Blocks>
void EmptyOutputs(Blocks**&... h) {
  (EmptyOutput(h), ...);
}

// Form A: a failed check or kernel. Outputs emptied, code stored, result 0.
template <class... Blocks>
int32 FailA(int32* err, ErrorCode code, Blocks**&... outputs) {
  EmptyOutputs(outputs...);
  *err = code;
  return 0;
}

// Form A: the host refused a resize. Outputs emptied, -20001 stored, and the
// host's own result returned from the entry.
template <class... Blocks>
int32 HostFailA(int32* err, int32 hostResult, Blocks**&... outputs) {
  EmptyOutputs(outputs...);
  *err = TSM_ERR_NO_MEMORY;
  return hostResult;
}

// Form A with a scalar result: the kernel's code goes to the error
// out-argument, and a failure puts NaN in the scalar.
inline int32 ReportScalarA(ErrorCode code, FailOn test, int32* err, f64* result) {
  *err = code;
  if (Failed(code, test)) *result = kNaN;
  return 0;
}

// Form B: a failure empties the outputs and is returned.
template <class... Blocks>
ErrorCode FailB(ErrorCode code, Blocks**&... outputs) {
  EmptyOutputs(outputs...);
  return code;
}

// Form B: a negative kernel code empties the outputs and is returned; zero or
// a warning is returned with the results in place.
template <class... Blocks>
ErrorCode ReportB(ErrorCode code, Blocks**&... outputs) {
  return code < 0 ? FailB(code, outputs...) : code;
}

}  // namespace tsm
