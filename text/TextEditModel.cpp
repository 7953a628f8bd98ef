#include "text/TextEditModel.h"

#include <algorithm>
#include <utility>

#include "platform/glob/KeyCodes.h"
#include "platform/kw/CharClassifier.h"

namespace {
using Item = EditHistory::Item;
using CharClass = CharClassifier::CharClass;

}  // namespace

// --- Contents ---

WString TextEditModel::textRange(int from, int to) const {
  if (from < 0 || to < 0) return {};
  const int lo = clampIndex(std::min(from, to));
  const int hi = clampIndex(std::max(from, to));
  return text_.substr(lo, hi - lo);
}

bool TextEditModel::setText(WString text, SeekMethod caretTo) {
  if (text_ == text && hasSaved_ && savedText() == text && !modified_) return false;
  if (text.size() > kMaxLength) text.resize(kMaxLength);
  text_ = std::move(text);
  ++revision_;
  saveText();
  modified_ = false;
  clearSelection();
  history_.clear();
  moveCaret(caretTo);
  return true;
}

void TextEditModel::saveText() {
  WString().swap(saved_);
  savedIsText_ = true;
  hasSaved_ = true;
}

void TextEditModel::detachSaved() {
  if (!savedIsText_) return;
  saved_ = text_;
  savedIsText_ = false;
}

bool TextEditModel::getChanged() const {
  return hasSaved_ ? text_ != savedText() : !text_.empty();
}

// --- Caret and selection ---

int TextEditModel::clampIndex(int index) const {
  return std::clamp(index, 0, length());
}

WString TextEditModel::selectedText() const {
  if (!hasSelection()) return {};
  return textRange(selectionLow(), selectionHigh());
}

int TextEditModel::seek(SeekMethod method, int from, int index) const {
  const int len = length();
  int i = clampIndex(from);
  switch (method) {
    case SeekMethod::PreviousChar:
      return std::max(i - 1, 0);
    case SeekMethod::NextChar:
      return std::min(i + 1, len);
    case SeekMethod::NextWord:
      return isMasked() ? len : CharClassifier::nextWordStart(text_, i);
    case SeekMethod::PreviousWord:
      return isMasked() ? 0 : CharClassifier::previousWordStart(text_, i);
    case SeekMethod::StartOfText:
      return 0;
    case SeekMethod::EndOfText:
      return len;
    case SeekMethod::ToIndex:
      return clampIndex(index);
  }
  return i;
}

void TextEditModel::moveCaret(SeekMethod method, int index) {
  if (seek(method, caret_, index) != caret_) {
    if (owner_) {
      owner_->ownerMovesCaret(method, index);
    } else {
      applyCaretMove(method, index);
    }
  }
  caret_ = clampIndex(caret_);
}

void TextEditModel::applyCaretMove(SeekMethod method, int index) {
  caret_ = seek(method, caret_, index);
}

bool TextEditModel::select(int anchor, int caret) {
  if (anchor < 0 || caret < 0) return false;
  setCaret(caret);
  selStart_ = clampIndex(anchor);
  selEnd_ = caret_;
  return true;
}

void TextEditModel::extendSelectionTo(int index) {
  if (selStart_ < 0) anchorSelection();
  setCaret(index);
  selEnd_ = caret_;
}

void TextEditModel::selectWordAt(int index) {
  const int len = length();
  if (len == 0) {
    clearSelection();
    return;
  }
  if (isMasked()) {
    select(0, len);
    return;
  }
  const int at = std::clamp(index, 0, len - 1);
  const wchar_t ch = text_[at];
  int start = at;
  while (start > 0 && CharClassifier::sameCharType(text_[start - 1], ch)) --start;
  int end = at + 1;
  while (end < len && CharClassifier::sameCharType(text_[end], ch)) ++end;
  select(start, end);
}

void TextEditModel::dragTo(int index) {
  if (selStart_ < 0 || selEnd_ != caret_) return;
  setCaret(index);
  selEnd_ = caret_;
}

void TextEditModel::highlightAll(bool on) {
  if (!on) {
    clearSelection();
    return;
  }
  moveCaret(SeekMethod::EndOfText);
  if (text_.empty()) {
    clearSelection();
  } else {
    selStart_ = 0;
    selEnd_ = caret_;
  }
}

wchar_t TextEditModel::characterAtCaret() const {
  if (caret_ >= length()) return L' ';
  return isMasked() ? mask_ : text_[caret_];
}

// --- Settings ---

void TextEditModel::setCharacters(const WString& set, CharacterRestriction restriction) {
  charSet_ = set.empty() ? nullptr : std::make_unique<WString>(set);
  restriction_ = restriction;
}

const WString& TextEditModel::characterSet() const {
  static const WString none;
  return charSet_ ? *charSet_ : none;
}

bool TextEditModel::isRestricted(wchar_t ch) const {
  switch (restriction_) {
    case CharacterRestriction::OnlyListed:
      return characterSet().find(ch) == WString::npos;
    case CharacterRestriction::AllButListed:
      return characterSet().find(ch) != WString::npos;
    case CharacterRestriction::None:
      break;
  }
  return false;
}

bool TextEditModel::isAllowed(wchar_t ch) const {
  if (!CharClassifier::isPrintable(ch) || isRestricted(ch)) return false;
  if (sizeLimit_ == 0 || mode_ == EditMode::Overwrite) return true;
  // Judged as paste judges it: by the length once the selection that the character replaces
  // is gone.
  const std::size_t replaced = hasSelection() ? selectionHigh() - selectionLow() : 0;
  return text_.size() - replaced < sizeLimit_;
}

// --- Editing ---

void TextEditModel::applyReplace(std::size_t pos, std::size_t removeCount, const WString& insert) {
  pos = std::min(pos, text_.size());
  removeCount = std::min(removeCount, text_.size() - pos);
  detachSaved();
  text_.replace(pos, removeCount, insert);
  ++revision_;
}

bool TextEditModel::addCharacter(wchar_t ch) {
  if (!allows(ch)) return false;
  if (mode_ == EditMode::Overwrite && !hasSelection() && caret_ < length()) {
    return replaceRange(caret_, seek(SeekMethod::NextChar, caret_), WString(1, ch));
  }
  return paste(WString(1, ch));
}

bool TextEditModel::paste(const WString& s) {
  if (hasSelection()) return replaceRange(selectionLow(), selectionHigh(), s);
  return replaceRange(caret_, caret_, s);
}

bool TextEditModel::replaceRange(int from, int to, const WString& s) {
  Item item;
  item.caretBefore = caret_;
  item.selectionStartBefore = selStart_;
  item.selectionEndBefore = selEnd_;
  item.position = from;
  item.removed = text_.substr(from, to - from);

  // The replaced text goes first, so that the filter judges every character against the text
  // that it will join.
  if (!item.removed.empty()) {
    applyReplace(item.position, item.removed.size(), {});
    clearSelection();
    moveCaret(SeekMethod::ToIndex, item.position);
  }
  item.inserted = keptCharacters(s);
  if (item.removed.empty() && item.inserted.empty()) return false;

  clearSelection();
  modified_ = true;
  if (!item.inserted.empty()) {
    applyReplace(item.position, 0, item.inserted);
    if (item.inserted.size() == 1) {
      moveCaret(SeekMethod::NextChar);
    } else {
      moveCaret(SeekMethod::ToIndex, item.position + static_cast<int>(item.inserted.size()));
    }
  }
  item.caretAfter = caret_;
  history_.record(std::move(item));
  return true;
}

WString TextEditModel::keptCharacters(const WString& s) const {
  std::size_t end = s.size();
  while (end > 0 && CharClassifier::isLineBreak(s[end - 1])) --end;
  const std::size_t capacity = kMaxLength - text_.size();
  WString kept;
  kept.reserve(std::min(end, capacity));
  for (std::size_t i = 0; i < end && kept.size() < capacity; ++i) {
    wchar_t ch = s[i];
    if (CharClassifier::isLineBreak(ch)) {
      if (ch == L'\r' && i + 1 < end && s[i + 1] == L'\n') ++i;
      ch = L' ';
    }
    if (allows(ch)) kept += ch;
  }
  return kept;
}

bool TextEditModel::pasteUtf8(std::string_view bytes) {
  return paste(Kw::toWide(bytes));
}

bool TextEditModel::erase(int from, int to, bool undoable) {
  if (from < 0 || to < 0) return false;
  const int lo = clampIndex(std::min(from, to));
  const int hi = clampIndex(std::max(from, to));
  if (lo == hi) return false;
  Item item;
  if (undoable) {
    item.position = lo;
    item.removed = text_.substr(lo, hi - lo);
    item.caretBefore = caret_;
    item.selectionStartBefore = selStart_;
    item.selectionEndBefore = selEnd_;
    item.caretAfter = lo;
  }
  applyReplace(lo, hi - lo, {});
  clearSelection();
  modified_ = true;
  moveCaret(SeekMethod::ToIndex, lo);
  if (undoable) {
    item.caretAfter = caret_;
    history_.record(std::move(item));
  } else {
    history_.clear();  // the recorded positions no longer fit the text
  }
  return true;
}

bool TextEditModel::eraseSelectedText(bool undoable) {
  if (!hasSelection()) return false;
  return erase(selectionLow(), selectionHigh(), undoable);
}

WString TextEditModel::copyText() const {
  return hasSelection() ? selectedText() : text_;
}

WString TextEditModel::cut() {
  if (!hasSelection()) highlightAll(true);
  WString out = selectedText();
  eraseSelectedText(true);
  return out;
}

bool TextEditModel::isContiguousTyping(std::span<const Item> items) {
  if (items.size() < 2) return false;
  for (std::size_t i = 0; i + 1 < items.size(); ++i) {
    const Item& newer = items[i];
    const Item& older = items[i + 1];
    if (!newer.isTyping() || !older.isTyping() || newer.position != older.position + 1) {
      return false;
    }
  }
  return true;
}

void TextEditModel::revertGroup(std::span<const Item> items) {
  const Item& oldest = items.back();
  if (isContiguousTyping(items)) {
    // A typed word goes in one erase rather than one per character.
    applyReplace(oldest.position, items.size(), {});
  } else {
    for (const Item& item : items) applyReplace(item.position, item.inserted.size(), item.removed);
  }
  clearSelection();
  modified_ = true;
  setCaret(oldest.caretBefore);
  selStart_ = oldest.selectionStartBefore < 0 ? -1 : clampIndex(oldest.selectionStartBefore);
  selEnd_ = oldest.selectionEndBefore < 0 ? -1 : clampIndex(oldest.selectionEndBefore);
  if (selStart_ < 0 || selEnd_ < 0) clearSelection();
}

void TextEditModel::replayGroup(std::span<const Item> items) {
  if (isContiguousTyping(items)) {
    WString word;
    word.reserve(items.size());
    for (auto it = items.rbegin(); it != items.rend(); ++it) word += it->inserted;
    applyReplace(items.back().position, 0, word);
  } else {
    for (auto it = items.rbegin(); it != items.rend(); ++it) {
      applyReplace(it->position, it->removed.size(), it->inserted);
    }
  }
  clearSelection();
  modified_ = true;
  setCaret(items.front().caretAfter);
}

bool TextEditModel::undo() {
  return history_.undo([this](std::span<const Item> items) { revertGroup(items); });
}

bool TextEditModel::redo() {
  return history_.redo([this](std::span<const Item> items) { replayGroup(items); });
}

bool TextEditModel::revertToSaved() {
  if (!hasSaved_) return false;
  if (!savedIsText_ && text_ != saved_) {
    // Record only the stretch between the common start and the common end.
    const std::size_t shorter = std::min(text_.size(), saved_.size());
    std::size_t prefix = 0;
    while (prefix < shorter && text_[prefix] == saved_[prefix]) ++prefix;
    std::size_t suffix = 0;
    while (suffix < shorter - prefix &&
           text_[text_.size() - 1 - suffix] == saved_[saved_.size() - 1 - suffix]) {
      ++suffix;
    }
    Item item;
    item.position = static_cast<int>(prefix);
    item.removed = text_.substr(prefix, text_.size() - prefix - suffix);
    item.inserted = saved_.substr(prefix, saved_.size() - prefix - suffix);
    item.caretBefore = caret_;
    item.selectionStartBefore = selStart_;
    item.selectionEndBefore = selEnd_;
    item.caretAfter = static_cast<int>(saved_.size());
    applyReplace(prefix, item.removed.size(), item.inserted);
    history_.record(std::move(item));
  }
  highlightAll(true);
  modified_ = false;
  return true;
}

// --- Keys ---

bool TextEditModel::handleKey(unsigned key) {
  const bool shift = key & kKeyShift;
  const bool ctrl = key & kKeyCtrl;
  if (const wchar_t ch = typedCharacter(key)) {
    if (allows(ch)) {
      addCharacter(ch);
      return true;
    }
    // A character the filter refuses is swallowed; one refused only for want of room travels
    // on to the owner.
    return isRestricted(ch);
  }
  const unsigned code = key & ~(kKeyShift | kKeyCtrl);
  switch (code) {
    case kKeyBackspace:
      return eraseKey(false, ctrl);
    case kKeyDelete:
      return eraseKey(true, ctrl);
    case kKeyEscape:
      return revertToSaved();
    case kKeyHome:
    case kKeyLeft:
    case kKeyRight:
    case kKeyEnd:
      return handleCaretKey(code, ctrl, shift);
    default:
      return false;  // Tab, Enter and the shortcuts belong to the text box
  }
}

bool TextEditModel::eraseKey(bool forward, bool ctrl) {
  if (hasSelection()) {
    eraseSelectedText(true);
  } else if (forward) {
    erase(caret_, seek(ctrl ? SeekMethod::NextWord : SeekMethod::NextChar, caret_), true);
  } else if (caret_ > 0) {
    erase(seek(ctrl ? SeekMethod::PreviousWord : SeekMethod::PreviousChar, caret_), caret_, true);
  }
  return true;
}

bool TextEditModel::handleCaretKey(unsigned code, bool ctrl, bool shift) {
  if (shift && !hasSelection()) anchorSelection();
  switch (code) {
    case kKeyHome:
      moveCaret(SeekMethod::StartOfText);
      break;
    case kKeyLeft:
      moveCaret(ctrl ? SeekMethod::PreviousWord : SeekMethod::PreviousChar);
      break;
    case kKeyRight:
      moveCaret(ctrl ? SeekMethod::NextWord : SeekMethod::NextChar);
      break;
    case kKeyEnd:
      moveCaret(SeekMethod::EndOfText);
      break;
    default:
      return false;
  }
  if (shift) {
    selStart_ = std::max(selStart_, 0);
    selEnd_ = caret_;
  } else {
    clearSelection();
  }
  return true;
}
