#include "gallery/GalleryLook.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/look/FaceLook.h"

const Glib::iFont& GalleryLook::font(Font f) {
  using Glib::FontDesc;
  auto get = [](const FontDesc& d) -> const Glib::iFont& { return *Glib::fonts().get(d); };
  switch (f) {
    case Font::Title:
      return get(FontDesc("", 18, FontDesc::Bold));
    case Font::PageTitle:
      return get(FontDesc("", 22, FontDesc::Bold));
    case Font::Bold:
      return get(FontDesc("", 13, FontDesc::Bold));
    case Font::Caption:
      return get(FontDesc("", 11, FontDesc::Bold));
    case Font::Small:
      return get(FontDesc("", 11));
    case Font::Mono:
      return get(FontDesc(Glib::kMonospaceFontFace, 12));
    case Font::Body:
      break;
  }
  return get(FontDesc());
}

WString GalleryLook::elided(const WString& text, const Glib::iFont& font, int width) {
  if (font.textWidth(text) <= width) return text;
  const WString dots = L"\u2026";
  const int room = width - font.textWidth(dots);
  if (room < 0) return WString();
  // The caret nearest the room's end, then back until the part fits.
  size_t keep = static_cast<size_t>(std::max(0, font.locate(text, room).index));
  while (keep > 0 && font.textWidth(text.substr(0, keep)) > room) --keep;
  while (keep > 0 && text[keep - 1] == L' ') --keep;
  return text.substr(0, keep) + dots;
}

void GalleryLook::label(Glib::Painter& p, const String& utf8, const Kw::Box<int>& box, Font f,
                        const Colour& c, TextAlignment align) const {
  if (utf8.empty() || box.empty()) return;
  const Glib::iFont& fnt = font(f);
  p.text(elided(Kw::toWide(utf8), fnt, box.width()), box, fnt, c, align);
}

void GalleryLook::card(Glib::Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  Glib::FaceLook(palette_).raised(p, box, face);
}

void GalleryLook::well(Glib::Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  Glib::FaceLook(palette_).sunken(p, box, face);
}

void GalleryLook::lamp(Glib::Painter& p, XY<int> centre, const Colour& c) const {
  Glib::FaceLook(palette_).lamp(p, centre, c);
}

void GalleryLook::strip(Glib::Painter& p, const Kw::Box<int>& box) const {
  Glib::FaceLook(palette_).headerStrip(p, box);
}
