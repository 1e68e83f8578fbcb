// The process-wide arena behind the allocator front (internal to frame/).
//
// An arena block of n bytes is laid out as two pointer-width header words,
// `start` (the block's address at its making, later rewritten by the free of
// the preceding block so that out-of-order frees merge backwards) and `end`
// (the address just behind the block), then n bytes rounded up to the
// pointer width, then 8 spare bytes. Rounding keeps every header word aligned,
// since the words are changed by atomic operations. `top` moves by atomic
// fetch-and-add and compare-and-swap only; allocation and free never wait.
#pragma once

#include <atomic>
#include <cstdint>
#include <thread>

#include "frame/types.h"

namespace tsm {

inline constexpr uint32 kNoArena = 0xFFFFFFFFu;  // `count` while no arena exists
inline constexpr std::uintptr_t kArenaHeader = 2 * sizeof(std::uintptr_t);
inline constexpr std::uintptr_t kArenaSpare = 8;
inline constexpr std::uintptr_t kArenaGrain = sizeof(std::uintptr_t);
// Bytes behind `limit` in the buffer: the free of the topmost block exchanges
// the word at its end, which may lie just below `limit`.
inline constexpr std::uintptr_t kArenaSlack = kArenaHeader + kArenaSpare;

// The short critical section around the owner test: a test-and-set lock that
// yields while another thread holds it (it is held for a few instructions).
class OwnerLock {
 public:
  void lock() {
    while (held_.exchange(true, std::memory_order_acquire))
      while (held_.load(std::memory_order_relaxed)) std::this_thread::yield();
  }
  void unlock() { held_.store(false, std::memory_order_release); }

 private:
  std::atomic<bool> held_{false};
};

struct WorkspaceArena {
  std::atomic<uint32> count{kNoArena};  // live blocks
  std::atomic<std::uintptr_t> top{0};   // next free byte
  std::atomic<std::uintptr_t> base{0};
  std::atomic<std::uintptr_t> limit{0};
  std::atomic<std::uint8_t> enabled{0};
  std::uintptr_t owner = 0;  // thread identity; 0 admits every thread and is never written
  OwnerLock* ownerLock = nullptr;
};

extern WorkspaceArena gArena;

// Bytes of arena that a request of n bytes takes.
constexpr std::uintptr_t ArenaSpan(std::uintptr_t n) {
  return ((n + kArenaGrain - 1) & ~(kArenaGrain - 1)) + kArenaHeader + kArenaSpare;
}

// 0, or -20124 (owner test refused) / -20126 (exhausted); *out is null then.
ErrorCode ArenaAllocate(void** out, std::uintptr_t n);
void ArenaFree(void* p);
// Never shrinks; a failed growth frees the old block and nulls *p.
ErrorCode ArenaResize(void** p, std::uintptr_t bytes);

}  // namespace tsm
