// Lock-free bump arena. Every operation on `count`, `top` and the header
// words is atomic and sequentially consistent, in this order: allocation
// counts the block, bumps `top`, then writes the header; free merges into the
// next block's `start`, reads `top`, uncounts, then swaps `top` down. The
// only lock is the short critical section of the owner test.
#include "frame/arena.h"

#include <pthread.h>

#include <cstring>
#include <mutex>

namespace tsm {

WorkspaceArena gArena;

namespace {

std::atomic_ref<std::uintptr_t> Word(std::uintptr_t address) {
  return std::atomic_ref<std::uintptr_t>(*reinterpret_cast<std::uintptr_t*>(address));
}

bool OwnerAdmits() {
  std::lock_guard<OwnerLock> hold(*gArena.ownerLock);
  if (gArena.owner == 0) return true;
  return reinterpret_cast<std::uintptr_t>(pthread_self()) == gArena.owner;
}

// Uncounts a block. When the count reaches 0 nothing is live or under way,
// and `top` goes back to the base unless another thread moved it meanwhile.
// Returns whether the count reached 0.
bool Uncount() {
  std::uintptr_t seenTop = gArena.top.load();
  if (gArena.count.fetch_sub(1) != 1) return false;
  gArena.top.compare_exchange_strong(seenTop, gArena.base.load());
  return true;
}

ErrorCode Allocate(void** out, std::uintptr_t n) {
  *out = nullptr;
  if (!OwnerAdmits()) throw long{TSM_ERR_ARENA_OWNER};
  // The block is counted before `top` moves: a free that sees the count reach
  // 0 may then reset `top` to the base only while no allocation is under way
  // (counting after the bump would let a reset slip in between and hand the
  // new block's space out twice).
  gArena.count.fetch_add(1);
  const std::uintptr_t span = ArenaSpan(n);
  const std::uintptr_t block = gArena.top.fetch_add(span);
  if (block == 0) {  // no buffer: only reachable past the front, which needs an arena to be enabled
    gArena.count.fetch_sub(1);
    *out = reinterpret_cast<void*>(kArenaHeader);
    return TSM_SUCCESS;
  }
  std::uintptr_t newTop = block + span;
  if (newTop >= gArena.limit.load()) {
    // Nothing is written for a request that does not fit: concurrent failing
    // requests may push `top` well past the buffer before it is set back.
    // `top` stays at the limit until the count next reaches 0.
    gArena.top.compare_exchange_strong(newTop, gArena.limit.load());
    Uncount();
    throw long{TSM_ERR_ARENA_EXHAUSTED};
  }
  Word(block).exchange(block);
  Word(block + sizeof(std::uintptr_t)).store(newTop, std::memory_order_relaxed);  // read by this block's owner only
  *out = reinterpret_cast<void*>(block + kArenaHeader);
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode ArenaAllocate(void** out, std::uintptr_t n) {
  // The one exception of the library: raised and caught right here.
  try {
    return Allocate(out, n);
  } catch (long code) {
    return static_cast<ErrorCode>(code);
  }
}

void ArenaFree(void* p) {
  if (p == nullptr) return;
  const std::uintptr_t header = reinterpret_cast<std::uintptr_t>(p) - kArenaHeader;
  const std::uintptr_t start = Word(header).load();
  const std::uintptr_t end = Word(header + sizeof(std::uintptr_t)).load();
  Word(end).exchange(start);  // the next block now claims this block's space too
  if (!Uncount()) {
    // Roll back when this block (with everything merged into it) is topmost.
    std::uintptr_t expected = end;
    gArena.top.compare_exchange_strong(expected, start);
  }
}

ErrorCode ArenaResize(void** p, std::uintptr_t bytes) {
  if (*p == nullptr) return ArenaAllocate(p, bytes);
  if (bytes == 0) {
    ArenaFree(*p);
    *p = nullptr;
    return TSM_SUCCESS;
  }
  const std::uintptr_t old = reinterpret_cast<std::uintptr_t>(*p);
  const std::uintptr_t capacity = Word(old - kArenaHeader + sizeof(std::uintptr_t)).load() - old;
  if (bytes < capacity) return TSM_SUCCESS;
  void* fresh = nullptr;
  const ErrorCode r = ArenaAllocate(&fresh, bytes);
  if (fresh != nullptr) std::memcpy(fresh, *p, capacity);
  ArenaFree(*p);  // in any case: a failed growth leaves the caller nothing to free
  *p = fresh;
  return r;
}

}  // namespace tsm
