// The allocator front: which back end serves a block, and how blocks follow
// their birth mode across a workspace switched on and off.
#include <cstring>

#include "frame/arena_fixture.h"

namespace tsmtest {
namespace {

using tsm::AnalysisAlloc;
using tsm::AnalysisFree;
using tsm::AnalysisResize;

class FrontTest : public ArenaTest {
 protected:
  void Enable(bool on) { ASSERT_EQ(tsm::WorkspaceEnable(on), 0); }
  bool InArena(const void* p) const {
    const auto a = reinterpret_cast<std::uintptr_t>(p);
    return a >= tsm::gArena.base.load() && a < tsm::gArena.limit.load();
  }
  void TearDown() override {
    tsm::WorkspaceEnable(false);
    ArenaTest::TearDown();
  }
};

void Fill(void* p, int n, unsigned char seed) {
  for (int i = 0; i < n; ++i) static_cast<unsigned char*>(p)[i] = static_cast<unsigned char>(seed + i);
}
bool Holds(const void* p, int n, unsigned char seed) {
  for (int i = 0; i < n; ++i)
    if (static_cast<const unsigned char*>(p)[i] != static_cast<unsigned char>(seed + i)) return false;
  return true;
}

TEST_F(FrontTest, ServesFromTheArenaOnlyWhileEnabled) {
  MakeArena(4096);
  void* heap = nullptr;
  ASSERT_EQ(AnalysisAlloc(&heap, 10), 0);
  EXPECT_FALSE(InArena(heap));
  EXPECT_EQ(Live(), 0u);

  Enable(true);
  void* arena = nullptr;
  ASSERT_EQ(AnalysisAlloc(&arena, 10), 0);
  EXPECT_TRUE(InArena(arena));
  EXPECT_EQ(Live(), 1u);
  // 10 bytes plus the 8-byte front header, rounded to 24, plus the arena's 24.
  EXPECT_EQ(Top(), 48u);

  // Each block goes back where it was born, whatever the mode is now.
  AnalysisFree(heap);
  EXPECT_EQ(Live(), 1u);
  Enable(false);
  AnalysisFree(arena);
  EXPECT_EQ(Live(), 0u);
  EXPECT_EQ(Top(), 0u);
  EXPECT_EQ(AnalysisFree(nullptr), 0);
}

TEST_F(FrontTest, ExhaustionReachesTheCallerAsOutOfMemory) {
  MakeArena(256);
  Enable(true);
  void* keep = nullptr;
  ASSERT_EQ(AnalysisAlloc(&keep, 8), 0);
  void* p = reinterpret_cast<void*>(1);
  EXPECT_EQ(AnalysisAlloc(&p, 1000), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(p, nullptr);
  // While a block is live, top stands at the limit: even small requests fail.
  EXPECT_EQ(AnalysisAlloc(&p, 8), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(tsm::AnalysisAllocPtr(8), nullptr);
  AnalysisFree(keep);
  ASSERT_EQ(AnalysisAlloc(&p, 8), 0);
  AnalysisFree(p);
  double* big = nullptr;
  EXPECT_EQ(tsm::AnalysisAllocArray(&big, std::int64_t{1} << 40), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(tsm::AnalysisAllocArray(&big, -1), TSM_ERR_NO_MEMORY);
}

TEST_F(FrontTest, ResizeFollowsTheWorkspaceBetweenCalls) {
  MakeArena(4096);
  void* p = nullptr;
  ASSERT_EQ(AnalysisResize(&p, 32), 0);  // null allocates
  Fill(p, 32, 1);

  Enable(true);
  ASSERT_EQ(AnalysisResize(&p, 64), 0);  // moves into the arena
  EXPECT_TRUE(InArena(p));
  EXPECT_TRUE(Holds(p, 32, 1));
  Fill(p, 64, 2);
  ASSERT_EQ(AnalysisResize(&p, 80), 0);  // grows within the arena
  EXPECT_TRUE(Holds(p, 64, 2));
  EXPECT_EQ(Live(), 1u);

  Enable(false);
  ASSERT_EQ(AnalysisResize(&p, 40), 0);  // back to the heap
  EXPECT_FALSE(InArena(p));
  EXPECT_EQ(Live(), 0u);
  // A block keeps its size at birth (64 here) as its recorded size: the move
  // copies the smaller of that and the new size.
  EXPECT_TRUE(Holds(p, 40, 2));
  ASSERT_EQ(AnalysisResize(&p, 0), 0);
  EXPECT_EQ(p, nullptr);
}

TEST_F(FrontTest, AMoveCopiesNoMoreThanTheSizeAtBirth) {
  MakeArena(4096);
  std::memset(reinterpret_cast<void*>(tsm::gArena.base.load()), 0, 4096);
  void* p = nullptr;
  ASSERT_EQ(AnalysisAlloc(&p, 16), 0);
  ASSERT_EQ(AnalysisResize(&p, 64), 0);  // same mode: grows, recorded size stays 16
  Fill(p, 64, 3);
  Enable(true);
  ASSERT_EQ(AnalysisResize(&p, 128), 0);
  EXPECT_TRUE(Holds(p, 16, 3));
  EXPECT_FALSE(Holds(p, 17, 3));
  AnalysisFree(p);
}

// A failed growth within the arena leaves nothing to free; a failed move
// from the heap into it keeps the old block.
TEST_F(FrontTest, FailedResizes) {
  MakeArena(256);
  void *heap = nullptr, *p = nullptr;
  ASSERT_EQ(AnalysisAlloc(&heap, 16), 0);
  Fill(heap, 16, 4);
  Enable(true);
  ASSERT_EQ(AnalysisAlloc(&p, 16), 0);
  EXPECT_EQ(AnalysisResize(&p, 1000), TSM_ERR_NO_MEMORY);
  EXPECT_EQ(p, nullptr);
  EXPECT_EQ(Live(), 0u);
  EXPECT_EQ(Top(), 0u);
  EXPECT_EQ(AnalysisResize(&heap, 1000), TSM_ERR_NO_MEMORY);
  ASSERT_NE(heap, nullptr);
  EXPECT_TRUE(Holds(heap, 16, 4));
  AnalysisFree(heap);
}

}  // namespace
}  // namespace tsmtest
