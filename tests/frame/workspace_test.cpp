// The four workspace entries: their states, codes and error cluster, and the
// host's clean-up of an arena.
#include <gtest/gtest.h>

#include "frame/arena.h"
#include "frame/workspace.h"
#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace tsmtest {
namespace {

enum Op { kInit, kInit0, kEnable, kDisable, kUninit };

int32_t RunOp(Op op, ErrorCluster* e) {
  switch (op) {
    case kInit: return InitializeAnalysisWorkspaceH(1024, e);
    case kInit0: return InitializeAnalysisWorkspaceH(0, e);
    case kEnable: return EnableAnalysisWorkspaceH(e);
    case kDisable: return DisableAnalysisWorkspaceH(e);
    case kUninit: return UninitializeAnalysisWorkspaceH(e);
  }
  return -1;
}

class WorkspaceEntries : public ::testing::Test {
 protected:
  void TearDown() override {
    tsm::WorkspaceCleanup(nullptr);
    EXPECT_EQ(tsrt_cleanup_mode(tsm::WorkspaceCleanup, nullptr), 0);
  }
};

TEST_F(WorkspaceEntries, StateMovesAndCodes) {
  struct Step { Op op; int32_t code; };
  // One walk through every legal and illegal move, from no arena.
  const Step walk[] = {
      {kInit0, 0},                           // no arena: a successful nothing
      {kUninit, 0},                          // likewise
      {kEnable, TSM_ERR_NO_ARENA},           {kDisable, TSM_ERR_NO_ARENA},
      {kInit, 0},                            {kInit, TSM_ERR_ARENA_EXISTS},
      {kEnable, 0},                          {kUninit, TSM_ERR_ARENA_ENABLED},
      {kInit0, TSM_ERR_ARENA_ENABLED},       {kEnable, 0},
      {kDisable, 0},                         {kDisable, 0},
      {kUninit, 0},                          {kDisable, TSM_ERR_NO_ARENA},
  };
  for (size_t i = 0; i < std::size(walk); ++i) {
    ErrorCluster e{0, 77};
    EXPECT_EQ(RunOp(walk[i].op, &e), 0) << "step " << i;
    EXPECT_EQ(e.code, walk[i].code) << "step " << i;
    EXPECT_EQ(e.status, walk[i].code < 0 ? 1 : 0) << "step " << i;
  }
}

TEST_F(WorkspaceEntries, UninitializeRefusesWhileBlocksLive) {
  ErrorCluster e{0, 0};
  InitializeAnalysisWorkspaceH(4096, &e);
  EnableAnalysisWorkspaceH(&e);
  void* p = nullptr;
  ASSERT_EQ(tsm::AnalysisAlloc(&p, 100), 0);
  DisableAnalysisWorkspaceH(&e);
  UninitializeAnalysisWorkspaceH(&e);
  EXPECT_EQ(e.code, TSM_ERR_ARENA_BLOCKS_LIVE);
  EXPECT_EQ(e.status, 1);
  tsm::AnalysisFree(p);
  e = ErrorCluster{0, 0};
  UninitializeAnalysisWorkspaceH(&e);
  EXPECT_EQ(e.code, 0);
}

TEST_F(WorkspaceEntries, APendingErrorMakesEveryEntryDoNothing) {
  for (Op op : {kInit, kInit0, kEnable, kDisable, kUninit}) {
    ErrorCluster e{1, 12345};
    EXPECT_EQ(RunOp(op, &e), 0);
    EXPECT_EQ(e.status, 1);
    EXPECT_EQ(e.code, 12345);
    EXPECT_EQ(tsm::gArena.count.load(), tsm::kNoArena) << op;
  }
}

TEST_F(WorkspaceEntries, TheArenaRegistersItsCleanUpWithTheHost) {
  ErrorCluster e{0, 0};
  InitializeAnalysisWorkspaceH(1024, &e);
  EXPECT_EQ(tsrt_cleanup_mode(tsm::WorkspaceCleanup, nullptr), 1);
  UninitializeAnalysisWorkspaceH(&e);
  EXPECT_EQ(tsrt_cleanup_mode(tsm::WorkspaceCleanup, nullptr), 0);
}

TEST_F(WorkspaceEntries, EndOfAHostRunFreesTheArenaWithBlocksOutstanding) {
  ErrorCluster e{0, 0};
  InitializeAnalysisWorkspaceH(4096, &e);
  EnableAnalysisWorkspaceH(&e);
  void* p = nullptr;
  ASSERT_EQ(tsm::AnalysisAlloc(&p, 100), 0);
  EXPECT_GE(tsrt_end_run(), 1);
  EXPECT_EQ(tsm::gArena.count.load(), tsm::kNoArena);
  EXPECT_EQ(tsm::gArena.enabled.load(), 0);
  // The outstanding block went with the arena; new requests come from the heap.
  void* q = nullptr;
  ASSERT_EQ(tsm::AnalysisAlloc(&q, 100), 0);
  tsm::AnalysisFree(q);
  InitializeAnalysisWorkspaceH(4096, &e);
  EXPECT_EQ(e.code, 0);
}

}  // namespace
}  // namespace tsmtest
