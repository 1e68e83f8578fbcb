// A fresh arena of a chosen size for each test, removed afterwards whatever
// the test left in it (through the host's clean-up path).
#pragma once

#include <gtest/gtest.h>

#include <cstdint>

#include "frame/arena.h"
#include "frame/workspace.h"

namespace tsmtest {

class ArenaTest : public ::testing::Test {
 protected:
  void MakeArena(tsm::uint32 size) {
    ASSERT_EQ(tsm::WorkspaceSize(size), 0);
    base_ = tsm::gArena.base.load();
  }
  void TearDown() override {
    tsm::WorkspaceCleanup(nullptr);
    ASSERT_EQ(tsm::gArena.count.load(), tsm::kNoArena);
  }
  std::uintptr_t Top() const { return tsm::gArena.top.load() - base_; }
  tsm::uint32 Live() const { return tsm::gArena.count.load(); }
  std::uintptr_t Offset(const void* p) const { return reinterpret_cast<std::uintptr_t>(p) - base_; }

  std::uintptr_t base_ = 0;
};

}  // namespace tsmtest
