// A host module for the binding tests. Its two services count their calls and
// record their arguments, then forward to the services set in `resize` and
// `cleanup` (libtsrt's, as a rule). With no target a resize answers
// kCountingHostNoTarget and a clean-up call answers 0.
#pragma once

#include <cstdint>

constexpr int32_t kCountingHostNoTarget = 77;

extern "C" {

typedef int32_t (*CountingCleanupProc)(void* arg);

struct CountingHostState {
  int32_t (*resize)(int32_t typeCode, int32_t numDims, void* handleAddress, int32_t totalElements);
  int32_t (*cleanup)(CountingCleanupProc proc, void* arg, int32_t mode);
  int32_t failWith;  // non-zero: the next resize answers this instead of forwarding
  int32_t resizes;   // calls so far, and the arguments of the last one
  int32_t type, dims, total;
  int32_t cleanups;
  CountingCleanupProc proc;
  void* arg;
  int32_t mode;
};

// The module's one other export, found with dlsym.
typedef CountingHostState* (*CountingHostStateFn)(void);

}  // extern "C"
