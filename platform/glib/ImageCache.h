#pragma once
// Loaded images by path. A path that failed is remembered, so it is reported once and not
// read again until the cache is cleared.
#include <unordered_map>
#include <unordered_set>

#include "platform/glib/Image.h"

namespace Glib {

class ImageCache {
 public:
  Kw::Ptr<Image> get(const String& path, int placeholderWidth, int placeholderHeight);
  // Forgets every image (files are read again on the next request); failures already
  // reported stay reported.
  void clear() { images_.clear(); }
  size_t size() const { return images_.size(); }

  static ImageCache& instance();

 private:
  std::unordered_map<String, Kw::Ptr<Image>> images_;
  std::unordered_set<String> reported_;
};

}  // namespace Glib
