// The reference host runtime.
#include "tsrt.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <mutex>
#include <utility>
#include <vector>

namespace {

constexpr unsigned char kFreshByte = 0xFF;  // new elements: NaN as float, -1 as integer
constexpr unsigned char kDeadByte = 0xDB;   // a block left behind by a move

struct Registration {
  TsrtCleanupProc proc;
  void* arg;
  int32_t mode;
};

struct Host {
  std::mutex lock;
  int64_t resizeCalls = 0;
  int64_t failAt = 0;  // absolute call number that fails; 0 none
  bool alwaysMove = false;
  int64_t liveBlocks = 0;
  int64_t liveBytes = 0;
  std::vector<Registration> cleanups;
};

Host& TheHost() {
  static Host* host = new Host;  // never destroyed: clean-ups may run from static destructors elsewhere
  return *host;
}

// A block is preceded by its size, so that accounting and moves know it.
struct BlockHead {
  std::size_t bytes;
  std::size_t pad;  // keeps the block itself 16-aligned
};

void* NewBlock(std::size_t bytes) {
  auto* head = static_cast<BlockHead*>(std::malloc(sizeof(BlockHead) + bytes));
  if (head == nullptr) return nullptr;
  head->bytes = bytes;
  return head + 1;
}

std::size_t BlockBytes(void* block) { return (static_cast<BlockHead*>(block) - 1)->bytes; }

void FreeBlock(void* block) { std::free(static_cast<BlockHead*>(block) - 1); }

// New size of a block, moving it when asked to or when the heap must.
void* ResizeBlock(void* block, std::size_t bytes, bool move) {
  const std::size_t old = BlockBytes(block);
  void* fresh = nullptr;
  if (move) {
    fresh = NewBlock(bytes);
    if (fresh == nullptr) return nullptr;
    std::memcpy(fresh, block, std::min(old, bytes));
    std::memset(block, kDeadByte, old);
    FreeBlock(block);
  } else {
    auto* head = static_cast<BlockHead*>(std::realloc(static_cast<BlockHead*>(block) - 1, sizeof(BlockHead) + bytes));
    if (head == nullptr) return nullptr;
    head->bytes = bytes;
    fresh = head + 1;
  }
  if (bytes > old) std::memset(static_cast<char*>(fresh) + old, kFreshByte, bytes - old);
  return fresh;
}

constexpr int64_t kMaxBlockBytes = int64_t{1} << 40;

}  // namespace

extern "C" {

const uint32_t gTSRTVersion = 0x01000000u;

int32_t tsrt_element_size(int32_t typeCode) {
  switch (typeCode) {
    case 1: case 5: return 1;        // int8, uint8
    case 2: case 6: return 2;        // int16, uint16
    case 3: case 7: case 9: return 4; // int32, uint32, float32
    case 4: case 8: case 10: case 12: return 8;  // int64, uint64, float64, complex float32
    case 13: return 16;              // complex float64
    default: return 0;
  }
}

int32_t NumericArrayResize(int32_t typeCode, int32_t numDims, void* handleAddress, int32_t totalElements) {
  const int32_t elem = tsrt_element_size(typeCode);
  if (elem == 0 || numDims < 1 || numDims > 8 || totalElements < 0 || handleAddress == nullptr)
    return TSRT_ARG_ERROR;
  const int64_t bytes64 = int64_t{4} * numDims + int64_t{elem} * totalElements;
  if (bytes64 > kMaxBlockBytes) return TSRT_MEMORY_FULL;
  const auto bytes = static_cast<std::size_t>(bytes64);

  Host& host = TheHost();
  bool move;
  {
    std::lock_guard<std::mutex> hold(host.lock);
    ++host.resizeCalls;
    if (host.resizeCalls == host.failAt) return TSRT_MEMORY_FULL;
    move = host.alwaysMove;
  }
  void*** slot = static_cast<void***>(handleAddress);
  int64_t blocksAdded = 0, bytesAdded = 0;
  if (*slot == nullptr) {
    void** master = static_cast<void**>(std::malloc(sizeof(void*)));
    void* block = master != nullptr ? NewBlock(bytes) : nullptr;
    if (block == nullptr) {
      std::free(master);
      return TSRT_MEMORY_FULL;
    }
    std::memset(block, kFreshByte, bytes);
    *master = block;
    *slot = master;
    blocksAdded = 1;
    bytesAdded = static_cast<int64_t>(bytes);
  } else {
    void** master = *slot;
    const std::size_t old = BlockBytes(*master);
    void* block = ResizeBlock(*master, bytes, move);
    if (block == nullptr) return TSRT_MEMORY_FULL;
    *master = block;
    bytesAdded = static_cast<int64_t>(bytes) - static_cast<int64_t>(old);
  }
  std::lock_guard<std::mutex> hold(host.lock);
  host.liveBlocks += blocksAdded;
  host.liveBytes += bytesAdded;
  return 0;
}

int32_t RTSetCleanupProc(TsrtCleanupProc proc, void* arg, int32_t mode) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  auto same = [&](const Registration& r) { return r.proc == proc && r.arg == arg; };
  auto it = std::find_if(host.cleanups.begin(), host.cleanups.end(), same);
  if (mode == 0) {
    if (it != host.cleanups.end()) host.cleanups.erase(it);
  } else if (it != host.cleanups.end()) {
    it->mode = mode;
  } else {
    host.cleanups.push_back(Registration{proc, arg, mode});
  }
  return 0;
}

void* tsrt_new_matrix(int32_t typeCode, int32_t rows, int32_t cols, const void* data) {
  void* handle = nullptr;
  if (rows < 0 || cols < 0 || NumericArrayResize(typeCode, 2, &handle, rows * cols) != 0) return nullptr;
  char* block = static_cast<char*>(*static_cast<void**>(handle));
  std::memcpy(block, &rows, 4);
  std::memcpy(block + 4, &cols, 4);
  const std::size_t bytes = std::size_t(tsrt_element_size(typeCode)) * std::size_t(rows) * std::size_t(cols);
  if (data != nullptr)
    std::memcpy(block + 8, data, bytes);
  else
    std::memset(block + 8, 0, bytes);
  return handle;
}

void* tsrt_new_array(int32_t typeCode, int32_t count, const void* data) {
  void* handle = nullptr;
  if (count < 0 || NumericArrayResize(typeCode, 1, &handle, count) != 0) return nullptr;
  char* block = static_cast<char*>(*static_cast<void**>(handle));
  std::memcpy(block, &count, 4);
  const std::size_t bytes = std::size_t(tsrt_element_size(typeCode)) * std::size_t(count);
  if (data != nullptr)
    std::memcpy(block + 4, data, bytes);
  else
    std::memset(block + 4, 0, bytes);
  return handle;
}

void tsrt_dispose(void* handle) {
  if (handle == nullptr) return;
  void** master = static_cast<void**>(handle);
  const auto bytes = static_cast<int64_t>(BlockBytes(*master));
  FreeBlock(*master);
  std::free(master);
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  host.liveBlocks -= 1;
  host.liveBytes -= bytes;
}

void tsrt_fail_resize_at(int64_t k) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  host.failAt = k > 0 ? host.resizeCalls + k : 0;
}

int64_t tsrt_resize_calls(void) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  return host.resizeCalls;
}

void tsrt_always_move(int32_t on) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  host.alwaysMove = on != 0;
}

int64_t tsrt_live_blocks(void) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  return host.liveBlocks;
}

int64_t tsrt_live_bytes(void) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  return host.liveBytes;
}

int32_t tsrt_cleanup_count(void) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  return static_cast<int32_t>(host.cleanups.size());
}

int32_t tsrt_cleanup_mode(TsrtCleanupProc proc, void* arg) {
  Host& host = TheHost();
  std::lock_guard<std::mutex> hold(host.lock);
  for (const Registration& r : host.cleanups)
    if (r.proc == proc && r.arg == arg) return r.mode;
  return 0;
}

int32_t tsrt_end_run(void) {
  std::vector<Registration> run;
  {
    Host& host = TheHost();
    std::lock_guard<std::mutex> hold(host.lock);
    run.swap(host.cleanups);
  }
  // Outside the lock: a clean-up may call back into the host.
  for (auto it = run.rbegin(); it != run.rend(); ++it) it->proc(it->arg);
  return static_cast<int32_t>(run.size());
}

}  // extern "C"
