#pragma once
// One column of a table: how wide it is, what colour and palette it is drawn in, how its text
// is aligned, and what the user may do in it (edit, resize, reorder rows, edit tagged rows
// together). The column holds settings only; the table (DataTable) lays columns out side by
// side, draws them and handles the input.
//
// Decisions where the behaviour was left open:
// - The width never falls below the minimum width: a smaller width is taken as the minimum,
//   and raising the minimum widens a narrower column. Both are at least 2 * textMargin + 1.
// - A column without a colour of its own draws its cells in the base colour of the table's
//   palette; one without a palette of its own uses the table's.
// - The line height is the height of a row, in pixels, from kMinLineHeight to kMaxLineHeight;
//   other heights are refused with a diagnostic. A table's rows are as tall as the tallest
//   line height of its columns.
// - A sticky column stays at the left while the other columns scroll sideways; sticky
//   columns are shown before the others, in their order.
// - Can-edit-tagged-items: an edit of a tagged row in this column is stored in every tagged
//   row; without it the edit goes to that row alone.
#include <optional>

#include "platform/glib/TextAlignment.h"
#include "platform/glob/Colour.h"
#include "platform/glob/Palette.h"

class DataColumn {
 public:
  enum ReadOnlyFlag : int { Editable = 0, ReadOnly = 1 };

  // Space between a cell's edges and its text, each side.
  static constexpr int textMargin = 4;
  static constexpr unsigned short kDefaultWidth = 100;
  static constexpr unsigned short kDefaultMinWidth = 24;
  static constexpr unsigned short kDefaultLineHeight = 20;
  static constexpr unsigned short kMinLineHeight = 8;
  static constexpr unsigned short kMaxLineHeight = 200;

  DataColumn() = default;
  explicit DataColumn(unsigned short width, TextAlignment alignment = TextAlignment::Left);

  unsigned short getWidth() const { return width_; }
  void setWidth(unsigned short width);
  unsigned short getMinWidth() const { return minWidth_; }
  void setMinWidth(unsigned short width);

  void setColour(const Colour& colour) { colour_ = colour; }
  void clearColour() { colour_.reset(); }
  bool hasColour() const { return colour_.has_value(); }
  // The column's own colour, or `fallback` when it has none.
  Colour getCol(const Colour& fallback = Colour()) const { return colour_.value_or(fallback); }

  void setPalette(const Palette& palette) { palette_ = palette; }
  void clearPalette() { palette_.reset(); }
  bool hasPalette() const { return palette_.has_value(); }
  const Palette& getPalette(const Palette& fallback) const {
    return palette_ ? *palette_ : fallback;
  }

  TextAlignment getAlignment() const { return alignment_; }
  void setAlignment(TextAlignment alignment) { alignment_ = alignment; }
  ReadOnlyFlag getReadOnly() const { return readOnly_; }
  void setReadOnly(ReadOnlyFlag flag) { readOnly_ = flag; }
  bool isReadOnly() const { return readOnly_ == ReadOnly; }
  bool isSticky() const { return sticky_; }
  void setSticky(bool sticky) { sticky_ = sticky; }
  bool isResizeable() const { return resizeable_; }
  void setResizeable(bool resizeable) { resizeable_ = resizeable; }
  bool canSwapItems() const { return canSwapItems_; }
  void setCanSwapItems(bool can) { canSwapItems_ = can; }
  bool canEditTaggedItems() const { return canEditTaggedItems_; }
  void setCanEditTaggedItems(bool can) { canEditTaggedItems_ = can; }
  unsigned short getLineHeight() const { return lineHeight_; }
  // False, with a diagnostic and the height kept, outside kMinLineHeight..kMaxLineHeight.
  bool setLineHeight(unsigned short height);

 private:
  static constexpr unsigned short kSmallestWidth = 2 * textMargin + 1;

  unsigned short width_ = kDefaultWidth;
  unsigned short minWidth_ = kDefaultMinWidth;
  std::optional<Colour> colour_;
  std::optional<Palette> palette_;
  TextAlignment alignment_ = TextAlignment::Left;
  ReadOnlyFlag readOnly_ = Editable;
  bool sticky_ = false;
  bool resizeable_ = true;
  bool canSwapItems_ = false;
  bool canEditTaggedItems_ = false;
  unsigned short lineHeight_ = kDefaultLineHeight;
};
