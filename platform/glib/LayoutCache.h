#pragma once
// Shaped text kept for reuse, keyed by font and text, least recently used first out. Redrawing
// unchanged text then costs no shaping. Long texts are shaped each time instead of being kept,
// so the cache's memory stays bounded by its entry count.
#include <list>
#include <string_view>
#include <unordered_map>

#include "platform/glib/TextLayout.h"

namespace Glib {

class LayoutCache {
 public:
  static constexpr size_t kDefaultCapacity = 1024;  // a full screen of labels, twice over
  static constexpr size_t kMaxCachedChars = 1024;

  explicit LayoutCache(size_t capacity = kDefaultCapacity) : capacity_(capacity) {}

  // The layout for `text` in font number `fontId`, made by `make` on a miss.
  template <typename Make>
  Kw::Ptr<TextLayout> get(int fontId, const WString& text, Make&& make) {
    if (text.size() > kMaxCachedChars) return make();
    const KeyView view{fontId, text};
    if (auto it = index_.find(view); it != index_.end()) {
      ++hits_;
      lru_.splice(lru_.begin(), lru_, it->second);
      return it->second->layout;
    }
    ++misses_;
    Kw::Ptr<TextLayout> layout = make();
    lru_.push_front(Entry{Key{fontId, text}, layout});
    index_.emplace(KeyView{fontId, lru_.front().key.text}, lru_.begin());
    if (lru_.size() > capacity_) evictOldest();
    return layout;
  }

  size_t size() const { return lru_.size(); }
  size_t capacity() const { return capacity_; }
  void setCapacity(size_t capacity);
  void clear();
  size_t hits() const { return hits_; }
  size_t misses() const { return misses_; }

 private:
  struct Key {
    int font;
    WString text;
  };
  struct Entry {
    Key key;
    Kw::Ptr<TextLayout> layout;
  };
  // The index refers to the text held by the list entry; lookups need no copy of the text.
  struct KeyView {
    int font;
    std::wstring_view text;
    bool operator==(const KeyView& o) const { return font == o.font && text == o.text; }
  };
  struct KeyHash {
    size_t operator()(const KeyView& k) const {
      return std::hash<std::wstring_view>()(k.text) * 31u + static_cast<size_t>(k.font);
    }
  };

  void evictOldest();

  size_t capacity_;
  std::list<Entry> lru_;
  std::unordered_map<KeyView, std::list<Entry>::iterator, KeyHash> index_;
  size_t hits_ = 0;
  size_t misses_ = 0;
};

}  // namespace Glib
