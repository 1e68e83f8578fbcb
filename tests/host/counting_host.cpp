// Services of the counting host module; see counting_host.h.
#include "counting_host.h"

#include <utility>

namespace {

CountingHostState gState{};

}  // namespace

extern "C" {

CountingHostState* counting_host_state() { return &gState; }

int32_t NumericArrayResize(int32_t typeCode, int32_t numDims, void* handleAddress, int32_t totalElements) {
  ++gState.resizes;
  gState.type = typeCode;
  gState.dims = numDims;
  gState.total = totalElements;
  if (gState.failWith != 0) return std::exchange(gState.failWith, 0);
  if (gState.resize == nullptr) return kCountingHostNoTarget;
  return gState.resize(typeCode, numDims, handleAddress, totalElements);
}

int32_t RTSetCleanupProc(CountingCleanupProc proc, void* arg, int32_t mode) {
  ++gState.cleanups;
  gState.proc = proc;
  gState.arg = arg;
  gState.mode = mode;
  return gState.cleanup != nullptr ? gState.cleanup(proc, arg, mode) : 0;
}

}  // extern "C"
