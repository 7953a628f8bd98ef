#pragma once
// Memory for large, long-lived buffers (a screen's image): whole pages straight from the
// system, on huge pages where the system offers them, so that a full-screen fill walks a few
// translation entries instead of thousands. Contents start zeroed.
#include <cstddef>

class LargeBlock {
 public:
  // Null when the system refuses the memory.
  static void* allocate(std::size_t bytes);
  // `bytes` as given to allocate.
  static void release(void* block, std::size_t bytes);
};
