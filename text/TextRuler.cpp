#include "text/TextRuler.h"

#include <algorithm>

#include "platform/kw/CharClassifier.h"

namespace {

bool isSpace(wchar_t ch) {
  return CharClassifier::classOf(ch) == CharClassifier::CharClass::Space;
}

// Marks that join the character before them; a piece never starts with one.
bool isCombining(wchar_t ch) {
  const auto c = static_cast<std::uint32_t>(ch);
  return (c >= 0x0300 && c <= 0x036F) || (c >= 0x1AB0 && c <= 0x1AFF) ||
         (c >= 0x1DC0 && c <= 0x1DFF) || (c >= 0x20D0 && c <= 0x20FF) ||
         (c >= 0xFE00 && c <= 0xFE0F) || (c >= 0xFE20 && c <= 0xFE2F) || c == 0x200D;
}

int64_t clampX(int64_t x) {
  return std::max<int64_t>(x, 0);
}

}  // namespace

void TextRuler::setFont(const Glib::FontPtr& font) {
  if (font == font_) return;
  font_ = font;
  maskWidth_ = -1;
  remeasureAll();
}

void TextRuler::remeasureAll() {
  for (Piece& p : pieces_) p.width = kUnmeasured;
  unsettledFrom_ = 0;
  settled_ = pieces_.empty();
}

void TextRuler::settle() const {
  if (settled_) return;
  std::size_t i = std::min(unsettledFrom_, pieces_.size());
  int64_t x = i > 0 ? pieces_[i - 1].x + pieces_[i - 1].width : 0;
  for (; i < pieces_.size(); ++i) {
    Piece& p = pieces_[i];
    if (p.width == kUnmeasured) p.width = measure(text_, p.start, p.length);
    p.x = x;
    x += p.width;
  }
  unsettledFrom_ = pieces_.size();
  settled_ = true;
}

int TextRuler::measure(const WString& text, int start, int length) const {
  ++measured_;
  if (!font_ || length <= 0) return 0;
  return font_->textWidth(
      text.substr(static_cast<std::size_t>(start), static_cast<std::size_t>(length)));
}

int TextRuler::pieceEnd(const WString& text, int start) const {
  const int n = static_cast<int>(text.size());
  const int hard = std::min(n, start + kMaxPiece);
  for (int i = start + kMinPiece; i < hard; ++i) {
    if (isSpace(text[i - 1]) && !isSpace(text[i])) return i;
  }
  int end = hard;
  while (end < n && end > start + 1 && isCombining(text[end])) --end;
  return end;
}

void TextRuler::setText(const WString& text) {
  if (mask_ != 0) {
    mask_ = 0;
    text_.clear();
    pieces_.clear();
    settled_ = true;
    length_ = 0;
  }
  const int oldLen = static_cast<int>(text_.size());
  const int newLen = static_cast<int>(text.size());
  const int shorter = std::min(oldLen, newLen);
  const int prefix = static_cast<int>(
      std::mismatch(text_.begin(), text_.begin() + shorter, text.begin()).first - text_.begin());
  if (prefix == oldLen && prefix == newLen) return;
  int suffix = 0;
  while (suffix < shorter - prefix && text_[oldLen - 1 - suffix] == text[newLen - 1 - suffix]) {
    ++suffix;
  }
  text_ = text;
  length_ = newLen;

  // Cut again from the piece holding the character before the change (its end may move).
  const std::size_t first = prefix == 0 ? 0 : pieceAt(prefix - 1);
  const int delta = newLen - oldLen;
  int pos = first < pieces_.size() ? pieces_[first].start : 0;
  std::vector<Piece> fresh;
  std::size_t keepFrom = pieces_.size();
  std::size_t old = first;
  while (pos < newLen) {
    if (pos >= newLen - suffix) {
      // In the unchanged tail: an old cut here means every old piece from it on still fits.
      const int oldPos = pos - delta;
      while (old < pieces_.size() && pieces_[old].start < oldPos) ++old;
      if (old < pieces_.size() && pieces_[old].start == oldPos) {
        keepFrom = old;
        break;
      }
    }
    const int end = pieceEnd(text_, pos);
    fresh.push_back(Piece{pos, end - pos, 0, kUnmeasured});
    pos = end;
  }
  const auto at = pieces_.begin() + static_cast<std::ptrdiff_t>(first);
  pieces_.erase(at, pieces_.begin() + static_cast<std::ptrdiff_t>(keepFrom));
  pieces_.insert(pieces_.begin() + static_cast<std::ptrdiff_t>(first), fresh.begin(), fresh.end());
  for (std::size_t i = first + fresh.size(); i < pieces_.size(); ++i) pieces_[i].start += delta;
  unsettledFrom_ = settled_ ? first : std::min(unsettledFrom_, first);
  settled_ = false;
}

void TextRuler::setMasked(wchar_t mask, int length) {
  text_.clear();
  pieces_.clear();
  settled_ = true;
  if (mask != mask_) maskWidth_ = -1;
  mask_ = mask;
  length_ = mask == 0 ? 0 : std::max(length, 0);
}

int TextRuler::maskWidth() const {
  if (maskWidth_ < 0) {
    maskWidth_ = font_ ? font_->textWidth(WString(kMaxPiece, mask_)) : 0;
  }
  return maskWidth_;
}

int64_t TextRuler::width() const {
  if (mask_ != 0) return xOf(length_);
  if (pieces_.empty()) return 0;
  settle();
  return pieces_.back().x + pieces_.back().width;
}

std::size_t TextRuler::pieceAt(int index) const {
  auto it = std::upper_bound(pieces_.begin(), pieces_.end(), index,
                             [](int i, const Piece& p) { return i < p.start; });
  return it == pieces_.begin() ? 0 : static_cast<std::size_t>(it - pieces_.begin() - 1);
}

std::size_t TextRuler::pieceAtX(int64_t x) const {
  auto it = std::upper_bound(pieces_.begin(), pieces_.end(), x,
                             [](int64_t v, const Piece& p) { return v < p.x; });
  return it == pieces_.begin() ? 0 : static_cast<std::size_t>(it - pieces_.begin() - 1);
}

int64_t TextRuler::xOf(int index) const {
  index = std::clamp(index, 0, length_);
  if (!font_) return 0;
  if (mask_ != 0) {
    const int chunk = index / kMaxPiece;
    const int within = index % kMaxPiece;
    const int64_t base = int64_t{chunk} * maskWidth();
    if (within == 0) return base;
    return base + font_->charSeek(WString(kMaxPiece, mask_), 0, Glib::iFont::ToIndex, within).x;
  }
  if (pieces_.empty()) return 0;
  settle();
  const Piece& p = pieces_[pieceAt(index)];
  const int within = index - p.start;
  if (within <= 0) return p.x;
  if (within >= p.length) return p.x + p.width;
  const WString piece =
      text_.substr(static_cast<std::size_t>(p.start), static_cast<std::size_t>(p.length));
  return p.x + font_->charSeek(piece, 0, Glib::iFont::ToIndex, within).x;
}

int TextRuler::indexAt(int64_t x) const {
  if (!font_ || length_ == 0) return 0;
  x = clampX(x);
  if (mask_ != 0) {
    const int w = maskWidth();
    if (w <= 0) return 0;
    const int64_t chunk = std::min<int64_t>(x / w, length_ / kMaxPiece);
    const int in = static_cast<int>(
        font_->locate(WString(kMaxPiece, mask_), static_cast<int>(x - chunk * w)).index);
    return std::min(length_, static_cast<int>(chunk * kMaxPiece) + in);
  }
  settle();
  const Piece& p = pieces_[pieceAtX(x)];
  const int64_t local = std::min<int64_t>(x - p.x, p.width);
  const WString piece =
      text_.substr(static_cast<std::size_t>(p.start), static_cast<std::size_t>(p.length));
  return p.start + font_->locate(piece, static_cast<int>(local)).index;
}

void TextRuler::forEachPiece(int64_t x0, int64_t x1, const PieceVisitor& visit) const {
  if (length_ == 0 || x1 <= x0) return;
  if (mask_ != 0) {
    const int w = maskWidth();
    if (w <= 0) return;
    const int chunks = (length_ + kMaxPiece - 1) / kMaxPiece;
    const int64_t firstChunk = std::clamp<int64_t>(clampX(x0) / w, 0, chunks - 1);
    for (int64_t c = firstChunk; c < chunks && c * w < x1; ++c) {
      const int start = static_cast<int>(c * kMaxPiece);
      const int count = std::min(kMaxPiece, length_ - start);
      visit(WString(static_cast<std::size_t>(count), mask_), start, c * w);
    }
    return;
  }
  settle();
  for (std::size_t i = pieceAtX(clampX(x0)); i < pieces_.size() && pieces_[i].x < x1; ++i) {
    const Piece& p = pieces_[i];
    if (p.x + p.width <= x0) continue;
    visit(text_.substr(static_cast<std::size_t>(p.start), static_cast<std::size_t>(p.length)),
          p.start, p.x);
  }
}
