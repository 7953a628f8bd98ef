#pragma once
// What a font is asked for by: face, pixel size and style. An empty face means the library's
// default face, so a default-constructed description is the standard UI font.
#include <cstddef>
#include <functional>
#include <utility>

#include "platform/kw/String.h"

namespace Glib {

// The standard UI face and size in pixels.
inline constexpr const char* kDefaultFontFace = "DejaVu Sans";
inline constexpr int kDefaultFontSize = 13;
// The library's monospaced face (what "courier" and "monospace" mean) and its serif face.
inline constexpr const char* kMonospaceFontFace = "DejaVu Sans Mono";
inline constexpr const char* kSerifFontFace = "DejaVu Serif";

struct FontDesc {
  enum Style : int { Plain = 0, Bold = 1, Italic = 2, BoldItalic = 3 };

  String face;                  // empty: kDefaultFontFace
  int size = kDefaultFontSize;  // pixels; values below 1 mean kDefaultFontSize
  Style style = Plain;

  FontDesc() = default;
  FontDesc(String f, int px, Style s = Plain) : face(std::move(f)), size(px), style(s) {}

  // The description with defaults filled in, as the font cache keys it.
  FontDesc resolved() const;
  bool bold() const { return (style & Bold) != 0; }
  bool italic() const { return (style & Italic) != 0; }

  bool operator==(const FontDesc& o) const = default;
};

struct FontDescHash {
  size_t operator()(const FontDesc& d) const {
    return std::hash<String>()(d.face) ^ (static_cast<size_t>(d.size) << 4) ^
           static_cast<size_t>(d.style);
  }
};

}  // namespace Glib
