// Scratch arrays on the C heap, for the kernels that are defined to bypass
// the allocator front (and so the workspace arena). Freed on scope exit.
#pragma once

#include <cstdint>
#include <cstdlib>

#include "frame/types.h"

namespace tsm {

template <class T>
class HeapScratch {
 public:
  HeapScratch() = default;
  HeapScratch(const HeapScratch&) = delete;
  HeapScratch& operator=(const HeapScratch&) = delete;
  ~HeapScratch() { std::free(p_); }
  // -20001 when the heap refuses or the size does not fit a size_t.
  ErrorCode Allocate(std::int64_t n) {
    std::free(p_);
    p_ = nullptr;
    if (n < 0 || static_cast<std::uint64_t>(n) > SIZE_MAX / sizeof(T) / 2) return TSM_ERR_NO_MEMORY;
    p_ = static_cast<T*>(std::calloc(static_cast<std::size_t>(n > 0 ? n : 1), sizeof(T)));
    return p_ != nullptr ? TSM_SUCCESS : TSM_ERR_NO_MEMORY;
  }
  T* get() const { return p_; }
  T& operator[](std::ptrdiff_t i) const { return p_[i]; }

 private:
  T* p_ = nullptr;
};

}  // namespace tsm
