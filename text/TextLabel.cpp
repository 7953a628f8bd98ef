#include "text/TextLabel.h"

#include <algorithm>

#include "panels/StandardPanel.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/LabelLook.h"

namespace {

Glib::FontDesc fontOf(int size, bool bold) {
  return Glib::FontDesc(String(), size > 0 ? size : Glib::kDefaultFontSize,
                        bold ? Glib::FontDesc::Bold : Glib::FontDesc::Plain);
}

GlobCreationInfo withPalette(GlobCreationInfo info, const Palette& palette) {
  info.palette = palette;
  return info;
}

}  // namespace

TextLabel::TextLabel(const WString& text, const Colour& textColour, const Colour& background,
                     int fontSize, bool bold, Canvas* parent)
    : rect(GlobCreationInfo(1, 1, parent)) {
  textColour_ = textColour;
  background_ = background;
  init(text, fontOf(fontSize, bold), true);
}

TextLabel::TextLabel(const WString& text, const Palette& palette, int fontSize, bool bold,
                     Canvas* parent)
    : rect(withPalette(GlobCreationInfo(1, 1, parent), palette)) {
  init(text, fontOf(fontSize, bold), true);
}

TextLabel::TextLabel(const TextLabelInitArgs& args) : rect(args.info) {
  textColour_ = args.textColour;
  background_ = args.background;
  const bool sized = args.info.width > 0 && args.info.height > 0;
  fixed_ = args.fixed && sized;
  init(args.text, args.font, !sized);
}

void TextLabel::init(const WString& text, const Glib::FontDesc& font, bool sizeToText) {
  fontDesc_ = font;
  font_ = Glib::fonts().get(fontDesc_);
  text_ = text;
  if (sizeToText) {
    // A new label stands where it was created, bottom-left corner first.
    const Kw::Box<int>& r = canvas()->rect();
    reshape_canvas(r.x0, r.y0, neededWidth(text_), font_->height() + kSizeAllowance);
  } else {
    growToFit();
  }
}

unsigned short TextLabel::calcHeight(unsigned short fontHeight) {
  const int h = fontHeight > 0 ? fontHeight : Glib::fonts().standard()->height();
  return static_cast<unsigned short>(h + kSizeAllowance);
}

int TextLabel::neededWidth(const WString& text) const {
  return font_->textWidth(text) + kSizeAllowance;
}

// --- Text ---

void TextLabel::setText(const WString& text) {
  if (!show(text)) return;
  // The adaptor may delete this label; nothing of it is touched afterwards.
  requestSetNewDataValue(text_, kPublishReason);
}

bool TextLabel::show(const WString& text) {
  if (text == text_) return false;
  text_ = text;
  growToFit();
  update();
  return true;
}

void TextLabel::growToFit() {
  if (fixed_) return;
  const int w = neededWidth(text_);
  if (w <= width()) return;
  resizeKeepingTop(w, font_->height() + kSizeAllowance);
}

void TextLabel::resizeKeepingTop(int w, int h) {
  w = std::clamp(w, 1, 0xFFFF);
  h = std::clamp(h, 1, 0xFFFF);
  const Kw::Box<int>& r = canvas()->rect();
  reshape_canvas(r.x0, r.y1 - h, w, h);
  reshape();
  // A panel that places this label from one of its origins places it again at its new size.
  if (auto* panel = dynamic_cast<StandardPanel*>(parent()); panel && panel->isChildWidget(this))
    panel->recalculateWidgetPositions();
}

// --- Look and size ---

void TextLabel::fixSize(unsigned short w, unsigned short h) {
  fixed_ = true;
  resizeKeepingTop(w, h);
  update();
}

void TextLabel::setTextColour(const Colour& colour) {
  if (textColour_ && *textColour_ == colour) return;
  textColour_ = colour;
  update();
}

Colour TextLabel::getTextColour() const {
  return textColour_ ? *textColour_ : getPalette().get(Palette::WindowText);
}

void TextLabel::setFont(const Glib::FontDesc& font) {
  if (font == fontDesc_) return;
  fontDesc_ = font;
  font_ = Glib::fonts().get(fontDesc_);
  growToFit();
  update();
}

void TextLabel::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::LabelLook look(getPalette());
  if (background_) look.background(p, p.bounds(), *background_);
  const Colour colour = isActive() ? getTextColour() : look.text(false);
  const Kw::Box<int> box(kSizeAllowance / 2, 0, width(), height());
  look.text(p, text_, box, *font_, colour);
}
