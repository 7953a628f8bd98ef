#include "platform/os/LargeBlock.h"

#include <sys/mman.h>

#include <cstdint>

namespace {

constexpr std::size_t kHugePage = std::size_t{2} << 20;

std::size_t roundUp(std::size_t n, std::size_t to) {
  return (n + to - 1) / to * to;
}

}  // namespace

void* LargeBlock::allocate(std::size_t bytes) {
  if (bytes == 0) return nullptr;
  const std::size_t size = roundUp(bytes, kHugePage);
  // Over-ask by one huge page and trim both ends, so that the block starts on a huge page.
  void* raw =
      mmap(nullptr, size + kHugePage, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (raw == MAP_FAILED) return nullptr;
  const auto start = reinterpret_cast<std::uintptr_t>(raw);
  const std::uintptr_t aligned = roundUp(start, kHugePage);
  if (aligned > start) munmap(raw, aligned - start);
  const std::size_t tail = kHugePage - (aligned - start);
  if (tail > 0) munmap(reinterpret_cast<void*>(aligned + size), tail);
  void* block = reinterpret_cast<void*>(aligned);
#ifdef MADV_HUGEPAGE
  madvise(block, size, MADV_HUGEPAGE);  // advice only: without huge pages the block still works
#endif
  return block;
}

void LargeBlock::release(void* block, std::size_t bytes) {
  if (block) munmap(block, roundUp(bytes, kHugePage));
}
