#pragma once
// A picture held in memory (premultiplied ARGB, as Cairo keeps it), shared and counted. Images
// loaded from files come from a cache by path; a file that cannot be read gives a placeholder
// of the requested size (a magenta-framed crossed box) and one diagnostic line per path.
#include <cairo.h>

#include "platform/kw/Ptr.h"
#include "platform/kw/String.h"

namespace Glib {

class Image : public Kw::RefCounted {
 public:
  // Size given to placeholders when the caller asks for none.
  static constexpr int kPlaceholderSize = 16;

  // Takes ownership of `surface` (an image surface).
  explicit Image(cairo_surface_t* surface, bool placeholder = false);
  ~Image() override;
  Image(const Image&) = delete;
  Image& operator=(const Image&) = delete;

  // The PNG at `path` (cached). When it cannot be read, a placeholder of `width` x `height`
  // (kPlaceholderSize when 0) takes its place, cached too.
  static Kw::Ptr<Image> load(const String& path, int width = 0, int height = 0);
  // A fresh placeholder picture.
  static Kw::Ptr<Image> placeholder(int width, int height);

  int width() const;
  int height() const;
  bool isPlaceholder() const { return placeholder_; }
  cairo_surface_t* surface() const { return surface_; }

 private:
  cairo_surface_t* surface_;
  bool placeholder_;
};

}  // namespace Glib
