#include "platform/glib/LayoutCache.h"

namespace Glib {

void LayoutCache::evictOldest() {
  const Entry& last = lru_.back();
  index_.erase(KeyView{last.key.font, last.key.text});
  lru_.pop_back();
}

void LayoutCache::setCapacity(size_t capacity) {
  capacity_ = capacity < 1 ? 1 : capacity;
  while (lru_.size() > capacity_) evictOldest();
}

void LayoutCache::clear() {
  index_.clear();
  lru_.clear();
}

}  // namespace Glib
