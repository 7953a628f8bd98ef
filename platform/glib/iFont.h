#pragma once
// A font of the drawing module: measures text and moves a caret through it. Fonts are shared
// and counted; get one from the font cache (Glib::fonts()).
#include <cstdint>

#include "platform/glib/FontDesc.h"
#include "platform/kw/Ptr.h"
#include "platform/kw/String.h"

namespace Glib {

class iFont : public Kw::RefCounted {
 public:
  // Caret moves. Words are runs of letters and digits (with '_'), or runs of other printable
  // characters; spaces separate them.
  enum eCharSeekMethod : int {
    PrevChar = 0,
    NextChar = 1,
    NextWord = 2,  // to the start of the next word (or the end)
    PrevWord = 3,  // to the start of this word, or of the previous one when at a word start
    Start = 4,
    End = 5,
    ToIndex = 6,  // to `toIndex`, clamped to the text
  };

  // A caret position: before character `index`, `x` pixels from the text's left edge.
  struct CharacterLocation {
    int32_t index = 0;
    int32_t x = 0;
    bool operator==(const CharacterLocation& o) const = default;
  };

  const FontDesc& desc() const { return desc_; }

  // Line height (ascent + descent) and the baseline's distance below the line's top, pixels.
  virtual int height() const = 0;
  virtual int ascent() const = 0;
  int descent() const { return height() - ascent(); }
  // Advance width of the text as it is drawn.
  virtual int textWidth(const WString& text) const = 0;

  // The caret position reached from `fromIndex` (clamped to 0..length) by `method`.
  virtual CharacterLocation charSeek(const WString& text, int fromIndex, eCharSeekMethod method,
                                     int toIndex = 0) const = 0;
  // The caret position nearest to pixel `x` (from the text's left edge); for mouse placement.
  virtual CharacterLocation locate(const WString& text, int x) const = 0;

 protected:
  explicit iFont(const FontDesc& desc) : desc_(desc) {}

 private:
  FontDesc desc_;
};

using FontPtr = Kw::Ptr<iFont>;

}  // namespace Glib
