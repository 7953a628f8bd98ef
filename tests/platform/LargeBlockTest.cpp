#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>

#include "platform/os/LargeBlock.h"

TEST(LargeBlock, ZeroedWritableAlignedAndGivenBack) {
  EXPECT_EQ(LargeBlock::allocate(0), nullptr);
  LargeBlock::release(nullptr, 100);  // harmless

  // An odd size, neither a page nor a huge page long, twice over so a released block is reused.
  for (int round = 0; round < 2; ++round) {
    const std::size_t bytes = 3 * 1024 * 1024 + 123;
    auto* p = static_cast<unsigned char*>(LargeBlock::allocate(bytes));
    ASSERT_NE(p, nullptr);
    EXPECT_EQ(reinterpret_cast<std::uintptr_t>(p) % (2u << 20), 0u) << "starts on a huge page";
    EXPECT_EQ(p[0], 0);
    EXPECT_EQ(p[bytes / 2], 0);
    EXPECT_EQ(p[bytes - 1], 0);
    std::memset(p, 0xAB, bytes);
    EXPECT_EQ(p[bytes - 1], 0xAB);
    LargeBlock::release(p, bytes);
  }
}
