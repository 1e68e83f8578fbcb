// Scratch from the C heap, for kernels whose working memory is defined not to
// come from the allocator front (and so not from the workspace arena).
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace tsm {

// Heap array freed when it goes out of scope; null after a failed Allocate.
template <class T>
class HeapScratch {
 public:
  HeapScratch() = default;
  HeapScratch(const HeapScratch&) = delete;
  HeapScratch& operator=(const HeapScratch&) = delete;
  ~HeapScratch() { std::free(p_); }
  // False when n is negative or memory is short.
  bool Allocate(std::int64_t n) {
    std::free(p_);
    p_ = n < 0 ? nullptr : static_cast<T*>(std::malloc(sizeof(T) * static_cast<std::size_t>(n > 0 ? n : 1)));
    return p_ != nullptr;
  }
  T* get() const { return p_; }
  T& operator[](std::ptrdiff_t i) const { return p_[i]; }

 private:
  T* p_ = nullptr;
};

}  // namespace tsm
