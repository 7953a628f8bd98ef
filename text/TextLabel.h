#pragma once
// A static line of text that grows to fit what it is given and publishes its text as a widget
// value (a wide string), so that a model value can both drive labels and hear what they show.
//
//   call                     not fixed                        fixed (fixSize)
//   setText(same text)       nothing                          nothing
//   setText(new text)        store; widen (and heighten) to   store; size kept
//                            fit, never narrower; publish
//                            with kPublishReason
//   setNewWidgetValue(v)     as setText, but publishes        as setText, no publishing
//                            nothing (the model is speaking)
//   fixSize(w, h)            becomes fixed at w by h          new fixed size
//
// Choices made here:
// - The int of the explicit constructors is the font's pixel size (0 for the standard size);
//   their bool makes the text bold. The colour form paints its background in the second
//   colour; the palette form and the init record without a background are transparent and
//   show what lies beneath.
// - A label measures its text at construction: the explicit forms start exactly as large as
//   the text needs (its width plus 2 by calcHeight); an init record with a size starts at that
//   size and grows from there.
// - A label made to fit its text keeps the bottom-left corner it was created at; growing
//   afterwards keeps the top-left corner where it is (labels read from the top down); a label
//   that a standard panel places is placed again by the panel afterwards.
// - Text is drawn on one line, left-aligned with one pixel of margin, centred vertically;
//   inactive labels draw in the disabled colour.
// - The published change reason is 4, the number that two-state controls also use for a
//   finished user change: an adaptor records it as one complete change.
#include <optional>

#include "foundation/DataChangeType.h"
#include "foundation/ValWidget.h"
#include "foundation/rect.h"
#include "platform/glib/FontDesc.h"
#include "platform/glib/iFont.h"
#include "platform/kw/String.h"

struct TextLabelInitArgs;

class TextLabel : public rect, public ValWidget<WString> {
 public:
  static constexpr DataChangeType kPublishReason = static_cast<DataChangeType>(4);
  // Pixels added to the text's width, and to the font's height, for the label's size.
  static constexpr int kSizeAllowance = 2;

  TextLabel(const WString& text, const Colour& textColour, const Colour& background, int fontSize,
            bool bold, Canvas* parent);
  TextLabel(const WString& text, const Palette& palette, int fontSize, bool bold, Canvas* parent);
  explicit TextLabel(const TextLabelInitArgs& args);

  // The height of a label whose font is `fontHeight` pixels high (0: the standard font's).
  static unsigned short calcHeight(unsigned short fontHeight);

  // --- Text ---
  void setText(const WString& text);
  void setString(const WString& text) { setText(text); }
  const WString& getText() const { return text_; }

  // --- Look and size ---
  // Fixes the size at `width` by `height`: from now on the label never resizes itself.
  void fixSize(unsigned short width, unsigned short height);
  bool isFixedSize() const { return fixed_; }
  void setTextColour(const Colour& colour);
  Colour getTextColour() const;
  void setFont(const Glib::FontDesc& font);
  const Glib::FontDesc& getFont() const { return fontDesc_; }
  // The width the text needs: its measured width plus kSizeAllowance.
  int neededWidth(const WString& text) const;

  // --- ValWidget ---
  WString getWidgetValue() override { return text_; }
  void setNewWidgetValue(WString& value) override { show(value); }
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

  // --- Glob ---
  MouseCursorID contextCursor(const XY<int>& pos) override { return kCursorArrow; }
  void draw() override;
  const char* idstring() const override { return "textlabel"; }
  String describeValue() const override { return Kw::toUtf8(text_); }

 private:
  void init(const WString& text, const Glib::FontDesc& font, bool sizeToText);
  // Stores and shows `text`, growing to fit unless fixed; false when it was already shown.
  bool show(const WString& text);
  void growToFit();
  void resizeKeepingTop(int width, int height);

  WString text_;
  Glib::FontDesc fontDesc_;
  Glib::FontPtr font_;
  std::optional<Colour> textColour_;
  std::optional<Colour> background_;
  bool fixed_ = false;
};

// Everything a label is made from. A zero width or height in `info` takes the size the text
// needs.
struct TextLabelInitArgs {
  GlobCreationInfo info;
  WString text;
  Glib::FontDesc font;
  std::optional<Colour> textColour;  // none: the palette's window text
  std::optional<Colour> background;  // none: transparent
  bool fixed = false;                // keep the size of `info` whatever the text
};
