#pragma once
// Pixel positions along one line of text, for a text box whose text may be very long.
//
// The line is measured in pieces of a few dozen characters, each shaped on its own and placed
// after the one before, so that an edit re-measures only the pieces it touches: typing at the
// end of a long text shapes one short piece, not the whole line. Drawing takes the same pieces
// at the same positions (`forEachPiece`), so the caret and the glyphs always agree.
//
// Piece boundaries depend only on the text from the piece's start onward: a piece ends where a
// run of spaces gives way to other text once it holds kMinPiece characters, and in any case at
// kMaxPiece characters (never just before a combining mark). After an edit the pieces are cut
// again from the one before the edit until a cut falls on an old cut in the unchanged tail;
// the rest keep their widths. Pieces break shaping across their ends (no kerning or joining
// between the last letter of one piece and the first of the next), which on the space-led cuts
// of ordinary text changes nothing.
//
// Measuring waits for the first question that needs a position: a box built with its text
// and never shown shapes nothing, and several edits between two paints are measured once.
//
// A masked ruler (obfuscated display) shows every character as one mask character of a
// monospace font: positions are multiples of its width, and no text is kept at all.
#include <cstdint>
#include <functional>
#include <vector>

#include "platform/glib/iFont.h"
#include "platform/kw/String.h"

class TextRuler {
 public:
  static constexpr int kMinPiece = 24;
  static constexpr int kMaxPiece = 96;

  // A stretch of the shown text drawn as one: its characters and where it starts.
  using PieceVisitor = std::function<void(const WString& text, int firstIndex, int64_t x)>;

  void setFont(const Glib::FontPtr& font);
  const Glib::FontPtr& font() const { return font_; }

  // The text as shown. Only the stretch that differs from the previous text is measured again.
  void setText(const WString& text);
  // Shows `length` characters as `mask`; with a mask of 0 the ruler goes back to plain text
  // (empty until the next setText).
  void setMasked(wchar_t mask, int length);
  bool isMasked() const { return mask_ != 0; }

  int length() const { return length_; }
  int64_t width() const;
  // The x of the caret before character `index` (clamped to the text).
  int64_t xOf(int index) const;
  // The caret index nearest to `x`.
  int indexAt(int64_t x) const;
  // Calls `visit` for each piece that meets the pixel range [x0, x1), left to right.
  void forEachPiece(int64_t x0, int64_t x1, const PieceVisitor& visit) const;

  std::size_t pieceCount() const { return pieces_.size(); }
  // How many pieces were measured since the ruler was made: lets tests see that an edit
  // re-measures only what it touched.
  std::uint64_t measuredPieces() const { return measured_; }

 private:
  static constexpr int kUnmeasured = -1;
  struct Piece {
    int start = 0;
    int length = 0;
    int64_t x = 0;  // from the line's start; valid once settled
    int width = kUnmeasured;
  };

  int pieceEnd(const WString& text, int start) const;
  int measure(const WString& text, int start, int length) const;
  // Measures the pieces that are not yet and places every piece from the first that moved.
  void settle() const;
  // The piece holding the caret position `index`: the last piece starting at or before it.
  std::size_t pieceAt(int index) const;
  std::size_t pieceAtX(int64_t x) const;
  void remeasureAll();
  int maskWidth() const;

  Glib::FontPtr font_;
  WString text_;
  // Widths and places are filled in by the const queries (settle), hence mutable.
  mutable std::vector<Piece> pieces_;
  mutable std::size_t unsettledFrom_ = 0;  // pieces from here on need placing
  mutable bool settled_ = true;
  int length_ = 0;
  wchar_t mask_ = 0;
  mutable int maskWidth_ = -1;
  mutable std::uint64_t measured_ = 0;
};
