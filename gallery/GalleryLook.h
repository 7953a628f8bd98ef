#pragma once
// The gallery's own chrome (header, page selector, page headings and cards, message log, the
// foundation page's tiles and key probe) in the library's look: colours by palette role and a
// few shades around the window colour, faces and bevels from the look layer (Glib::FaceLook),
// text through Glib::Painter, fonts from the font cache. Made from the palette of the Glob that
// draws.
#include "platform/glib/Painter.h"
#include "platform/glib/iFont.h"
#include "platform/glob/Palette.h"

class GalleryLook {
 public:
  enum class Font { Title, PageTitle, Body, Bold, Caption, Small, Mono };

  explicit GalleryLook(const Palette& palette) : palette_(palette) {}

  // The font cache keeps every font for the life of the process.
  static const Glib::iFont& font(Font f);

  // --- Colours ---
  const Colour& role(Palette::Role r) const { return palette_.get(r); }
  Colour backdrop() const { return palette_.windowShade(1); }
  Colour sidebar() const { return palette_.windowShade(0); }
  Colour hover() const { return palette_.windowShade(2); }
  Colour strongText() const { return role(Palette::ButtonText); }
  Colour text() const { return role(Palette::WindowText); }
  Colour dimText() const { return role(Palette::Disabled); }
  Colour faintText() const { return role(Palette::Ghost); }
  Colour accent() const { return role(Palette::Highlight); }
  Colour line() const { return role(Palette::Border); }
  // Message texts stand out in the caret's warm colour.
  Colour message() const { return role(Palette::Caret); }
  // A subsystem whose controls are on its page; still to come.
  static constexpr Colour kReady = Colour::fromHex(0x5DBB7A);
  Colour planned() const { return role(Palette::Ghost); }

  // --- Drawing ---
  // One line of UTF-8 text in `box`, vertically centred; cut short with an ellipsis when it is
  // wider than the box.
  void label(Glib::Painter& p, const String& utf8, const Kw::Box<int>& box, Font f, const Colour& c,
             TextAlignment align = TextAlignment::Left) const;
  // A raised panel face with a one-pixel bevel, as the library's panels have.
  void card(Glib::Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  // A sunken well (text fields, the log), one pixel deep.
  void well(Glib::Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  // A small square status lamp centred on `centre`.
  void lamp(Glib::Painter& p, XY<int> centre, const Colour& c) const;
  // The header strip: a gentle gradient over the window colour, a dark line below.
  void strip(Glib::Painter& p, const Kw::Box<int>& box) const;

  // `text` cut to fit `width` pixels in `font`, ending in an ellipsis when anything was cut;
  // empty when not even the ellipsis fits.
  static WString elided(const WString& text, const Glib::iFont& font, int width);

 private:
  const Palette& palette_;
};
