// A fixture for entry tests: ends the host run after each test (releasing
// every plain state's plan and holder) and checks that no host block leaked.
#pragma once

#include <gtest/gtest.h>

#include "tsrt.h"

namespace tsmtest {

class HostRunTest : public ::testing::Test {
 protected:
  void SetUp() override { blocks_ = tsrt_live_blocks(); }
  void TearDown() override {
    tsrt_end_run();
    EXPECT_EQ(tsrt_live_blocks(), blocks_);
  }

 private:
  int64_t blocks_ = 0;
};

}  // namespace tsmtest
