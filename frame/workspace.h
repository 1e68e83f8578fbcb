// Scratch memory for kernels: one allocator front over three back ends, the
// hook slots (filled with the C heap at load), the process-wide arena, and the
// C heap itself. While the workspace is enabled, requests are served by a
// lock-free bump pointer in a fixed arena and fail at once when it is full;
// every failure reaches the kernel as -20001.
//
// A front block carries an 8-byte header {int32 total; int32 mode} ahead of the
// caller's pointer and is always freed and resized by the mode it was born
// with, so a block made before the workspace was enabled goes back to the heap
// and the reverse goes back to the arena. Nothing here assumes any alignment
// of the caller's data beyond that of a byte.
#pragma once

#include <cstddef>
#include <cstdint>

#include "frame/types.h"

namespace tsm {

// *p receives the new block; 0 or -20001.
ErrorCode AnalysisAlloc(void** p, uint32 bytes);
// bytes 0 frees *p and sets it to null; a null *p allocates. On failure *p is
// kept, except that a failed arena resize loses the block (and nulls *p).
ErrorCode AnalysisResize(void** p, uint32 bytes);
// Null is accepted. Always 0.
ErrorCode AnalysisFree(void* p);
// Null on failure.
void* AnalysisAllocPtr(uint32 bytes);

// Typed front request for n elements; -20001 also when the size does not fit
// the allocator's 32-bit byte count.
template <class T>
ErrorCode AnalysisAllocArray(T** p, std::int64_t n) {
  *p = nullptr;
  const std::uint64_t bytes = static_cast<std::uint64_t>(n < 0 ? 0 : n) * sizeof(T);
  if (n < 0 || bytes > 0xFFFFFFFFull - 64) return TSM_ERR_NO_MEMORY;
  void* v = nullptr;
  const ErrorCode r = AnalysisAlloc(&v, static_cast<uint32>(bytes));
  *p = static_cast<T*>(v);
  return r;
}

// Front scratch array freed when it goes out of scope.
template <class T>
class Scratch {
 public:
  Scratch() = default;
  Scratch(const Scratch&) = delete;
  Scratch& operator=(const Scratch&) = delete;
  ~Scratch() { AnalysisFree(p_); }
  ErrorCode Allocate(std::int64_t n) {
    AnalysisFree(p_);
    return AnalysisAllocArray(&p_, n);
  }
  T* get() const { return p_; }
  T& operator[](std::ptrdiff_t i) const { return p_[i]; }

 private:
  T* p_ = nullptr;
};

// Workspace operations behind the four workspace entries.
// size 0 removes the arena (a successful nothing when there is none).
ErrorCode WorkspaceSize(uint32 size);
// Sets or clears `enabled`; -20122 without an arena.
ErrorCode WorkspaceEnable(bool on);
// The host's clean-up callback: frees the arena even with blocks outstanding.
int32 WorkspaceCleanup(void* ignored);

}  // namespace tsm
