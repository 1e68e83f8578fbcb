// The arena's own arithmetic: where blocks go, how frees merge and roll `top`
// back, and what exhaustion leaves behind.
#include <cstring>
#include <vector>

#include "frame/arena_fixture.h"

namespace tsmtest {
namespace {

using tsm::ArenaAllocate;
using tsm::ArenaFree;
using tsm::ArenaResize;

constexpr std::uintptr_t kHeader = 2 * sizeof(void*);

TEST_F(ArenaTest, BlocksAreLaidOutBackToBack) {
  MakeArena(4096);
  // A request takes its size rounded up to the word, a two-word header and 8 spare bytes.
  struct Case { std::uintptr_t n, span; } cases[] = {{0, 24}, {1, 32}, {8, 32}, {9, 40}, {100, 128}};
  std::uintptr_t at = 0;
  std::vector<void*> blocks;
  for (const Case& c : cases) {
    void* p = nullptr;
    ASSERT_EQ(ArenaAllocate(&p, c.n), 0) << c.n;
    EXPECT_EQ(Offset(p), at + kHeader) << c.n;
    at += c.span;
    EXPECT_EQ(Top(), at) << c.n;
    blocks.push_back(p);
  }
  EXPECT_EQ(Live(), blocks.size());
  for (void* p : blocks) ArenaFree(p);
  EXPECT_EQ(Live(), 0u);
  EXPECT_EQ(Top(), 0u);
}

TEST_F(ArenaTest, OutOfOrderFreesMergeBackwards) {
  MakeArena(4096);
  void *a, *b, *c;
  ASSERT_EQ(ArenaAllocate(&a, 40), 0);
  ASSERT_EQ(ArenaAllocate(&b, 40), 0);
  ASSERT_EQ(ArenaAllocate(&c, 40), 0);
  const std::uintptr_t startB = Offset(b) - kHeader;
  const std::uintptr_t full = Top();

  ArenaFree(b);  // not topmost: top stays
  EXPECT_EQ(Top(), full);
  ArenaFree(c);  // topmost, and owns B's space now: top falls to the start of B
  EXPECT_EQ(Top(), startB);
  ArenaFree(a);  // last block: back to the base
  EXPECT_EQ(Top(), 0u);
  EXPECT_EQ(Live(), 0u);
}

TEST_F(ArenaTest, AnyFreeOrderEndsAtTheBase) {
  const std::vector<std::vector<int>> orders = {{0, 1, 2, 3}, {3, 2, 1, 0}, {1, 3, 0, 2}, {2, 0, 3, 1}};
  for (const auto& order : orders) {
    MakeArena(4096);
    void* p[4];
    for (int i = 0; i < 4; ++i) ASSERT_EQ(ArenaAllocate(&p[i], 24 + 8 * i), 0);
    for (int i : order) ArenaFree(p[i]);
    EXPECT_EQ(Top(), 0u);
    EXPECT_EQ(Live(), 0u);
    TearDown();
  }
}

TEST_F(ArenaTest, ARequestMustEndStrictlyBelowTheLimit) {
  // In an arena of 256 bytes a request of 232 would end exactly at the limit.
  // A failure with nothing else live leaves the arena empty again.
  struct Case {
    std::uintptr_t n;
    ErrorCode code;
    std::uintptr_t top;
  } cases[] = {{224, 0, 248}, {232, TSM_ERR_ARENA_EXHAUSTED, 0}, {1000, TSM_ERR_ARENA_EXHAUSTED, 0}};
  for (const Case& c : cases) {
    MakeArena(256);
    void* p = reinterpret_cast<void*>(1);
    EXPECT_EQ(ArenaAllocate(&p, c.n), c.code) << c.n;
    EXPECT_EQ(p == nullptr, c.code != 0) << c.n;
    EXPECT_EQ(Live(), c.code == 0 ? 1u : 0u) << c.n;
    EXPECT_EQ(Top(), c.top) << c.n;
    ArenaFree(p);
    TearDown();
  }
}

TEST_F(ArenaTest, ExhaustionBlocksUntilTheCountReachesZero) {
  MakeArena(256);
  void *a = nullptr, *big = nullptr, *tiny = nullptr;
  ASSERT_EQ(ArenaAllocate(&a, 64), 0);
  EXPECT_EQ(ArenaAllocate(&big, 200), TSM_ERR_ARENA_EXHAUSTED);
  EXPECT_EQ(Top(), 256u);
  // Room is left below the limit, but top stands at it now.
  EXPECT_EQ(ArenaAllocate(&tiny, 1), TSM_ERR_ARENA_EXHAUSTED);
  EXPECT_EQ(Live(), 1u);
  ArenaFree(a);
  EXPECT_EQ(Top(), 0u);
  EXPECT_EQ(ArenaAllocate(&tiny, 1), 0);
  ArenaFree(tiny);
}

TEST_F(ArenaTest, ResizeKeepsSmallerRequestsAndMovesLargerOnes) {
  MakeArena(4096);
  void* p = nullptr;
  ASSERT_EQ(ArenaResize(&p, 16), 0);  // null: allocates
  ASSERT_NE(p, nullptr);
  std::memset(p, 0x5A, 16);
  void* const first = p;
  // Capacity is the rounded size plus the spare: below it nothing moves.
  ASSERT_EQ(ArenaResize(&p, 23), 0);
  EXPECT_EQ(p, first);
  ASSERT_EQ(ArenaResize(&p, 24), 0);
  EXPECT_NE(p, first);
  for (int i = 0; i < 16; ++i) EXPECT_EQ(static_cast<unsigned char*>(p)[i], 0x5A);
  EXPECT_EQ(Live(), 1u);
  ASSERT_EQ(ArenaResize(&p, 0), 0);  // 0 frees
  EXPECT_EQ(p, nullptr);
  EXPECT_EQ(Live(), 0u);
  EXPECT_EQ(Top(), 0u);
}

}  // namespace
}  // namespace tsmtest
