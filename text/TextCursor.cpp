#include "text/TextCursor.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TextFieldLook.h"
#include "platform/glob/RuntimeClock.h"

namespace {

GlobCreationInfo caretInfo(const Glib::FontPtr& font, Canvas* canvas) {
  GlobCreationInfo info(TextCursor::kThinWidth,
                        static_cast<unsigned short>(std::max(1, font->height())), canvas);
  return info;
}

double now() {
  return static_cast<double>(RuntimeClock::now());
}

}  // namespace

TextCursor::TextCursor(const Glib::FontDesc& font, Canvas* canvas)
    : TextCursor(Glib::FontPtr(Glib::fonts().get(font)), canvas) {}

TextCursor::TextCursor(Glib::FontPtr font, Canvas* canvas)
    : Glob(caretInfo(font, canvas)), font_(std::move(font)) {
  const Glib::TextFieldLook look(getPalette());
  caretColour_ = look.caret();
  inverseColour_ = look.caretInside();
}

void TextCursor::setFont(const Glib::FontDesc& font) {
  Glib::FontPtr f(Glib::fonts().get(font));
  if (f == font_) return;
  font_ = f;
  reshapeToFit();
}

void TextCursor::setCursorStyle(eStyle style) {
  if (style != StyleInsert && style != StyleBlock) return;
  if (style == style_) return;
  style_ = style;
  if (style_ == StyleInsert) current_ = 0;
  reshapeToFit();
}

void TextCursor::setCurrentChar(wchar_t ch) {
  if (style_ != StyleBlock || ch == current_) return;
  current_ = ch;
  reshapeToFit();
}

void TextCursor::setColours(const Colour& caret, const Colour& inverseText) {
  if (caret == caretColour_ && inverseText == inverseColour_) return;
  caretColour_ = caret;
  inverseColour_ = inverseText;
  update();
}

void TextCursor::placeAt(XY<int> pos) {
  if (pos == pos_) return;
  pos_ = pos;
  reshapeToFit();
}

int TextCursor::blockWidth() const {
  const wchar_t ch = current_ != 0 ? current_ : L' ';
  return std::max(kThinWidth, font_->textWidth(WString(1, ch)));
}

void TextCursor::reshapeToFit() {
  const int h = std::max(1, font_->height());
  const int w = style_ == StyleBlock ? blockWidth() : kThinWidth;
  const int x = style_ == StyleBlock ? pos_.x : pos_.x - kThinWidth / 2;
  const Kw::Box<int>& r = canvas()->rect();
  if (r.x0 == x && r.y0 == pos_.y && r.width() == w && r.height() == h) return;
  reshape_canvas(x, pos_.y, w, h);
  update();
}

void TextCursor::show() {
  map_canvas();
}

void TextCursor::hide() {
  unmap_canvas();
}

void TextCursor::activateFlash() {
  ensure_canvas_is_mapped();
  set_interest(kInterestTicks);
  flashing_ = true;
  lastToggle_ = now();
}

void TextCursor::deactivateFlash() {
  clear_interest(kInterestTicks);
  flashing_ = false;
  show();
}

void TextCursor::restartFlash() {
  restartPending_ = true;
  lastToggle_ = now();
  show();
}

int TextCursor::react(Event* e) {
  if (!tick_event(e)) return Glob::react(e);
  if (!flashing_) return 1;
  const double t = now();
  if (t - lastToggle_ > kTogglePeriodMs) {
    lastToggle_ = t;
    if (restartPending_) {
      restartPending_ = false;
      show();
      update();
    } else if (isVisible()) {
      hide();
    } else {
      show();
    }
  }
  return 1;
}

void TextCursor::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::TextFieldLook::caretBlock(p, caretColour_, style_ == StyleBlock, current_, *font_,
                                  inverseColour_);
}
