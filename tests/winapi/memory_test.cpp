// The stand-in heaps: fixed, optionally zero-filled blocks that know their size.
#include <windows.h>

#include <gtest/gtest.h>

#include <cstring>

namespace morvex::tests {
namespace {

TEST(StandInHeaps, ZeroFilledBlocksOfTheSizeAsked) {
  auto *block = static_cast<unsigned char *>(GlobalAlloc(GPTR, 26042));
  ASSERT_NE(block, nullptr);
  EXPECT_EQ(GlobalSize(block), 26042u);
  EXPECT_EQ(GlobalLock(block), block);
  for (std::size_t i = 0; i < 26042; ++i) {
    ASSERT_EQ(block[i], 0) << i;
  }
  EXPECT_EQ(GlobalFree(block), nullptr);

  auto *text = static_cast<char *>(LocalAlloc(LPTR, 80));
  ASSERT_NE(text, nullptr);
  EXPECT_EQ(std::strlen(text), 0u);
  EXPECT_EQ(LocalFree(text), nullptr);
}

TEST(StandInHeaps, MoveableBlocksAndImpossibleSizesAreRefused) {
  EXPECT_EQ(GlobalAlloc(GMEM_MOVEABLE, 16), nullptr);
  EXPECT_EQ(GlobalAlloc(GMEM_FIXED, static_cast<SIZE_T>(-1)), nullptr);
  EXPECT_EQ(GlobalFree(nullptr), nullptr);
  EXPECT_EQ(GlobalSize(nullptr), 0u);
}

} // namespace
} // namespace morvex::tests
