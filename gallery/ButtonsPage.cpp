#include "buttons/Button.h"
#include "buttons/ImageButton.h"
#include "buttons/ImageSearchPath.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "gallery/GalleryPages.h"
#include "platform/misc/ResourceStrings.h"

namespace {

// The gallery's own icons (drawn by tools/gallery-icons.cpp), found by name like any
// application's. A pale palette finds the dark-ink set first. The search path is the
// process's: the first palette to build the page decides.
void addGalleryIcons(const Palette& palette) {
  const Colour& w = palette.get(Palette::Window);
  const bool pale = 0.2126 * w.r + 0.7152 * w.g + 0.0722 * w.b > 0.5;
#ifdef GLOBKIT_GALLERY_ICONS
  if (pale) imageSearchPath().addDirectory(GLOBKIT_GALLERY_ICONS "/light");
  imageSearchPath().addDirectory(GLOBKIT_GALLERY_ICONS);
#endif
  if (pale) imageSearchPath().addDirectory("gallery/icons/light");
  imageSearchPath().addDirectory("gallery/icons");
}

// The size button's help texts, for a gallery run without the application's string table.
void addSizeButtonStrings() {
  if (!resourceStrings().contains(SizeButton::kContextStringSizeSet))
    resourceStrings().set(SizeButton::kContextStringSizeSet, L"Show the whole panel");
  if (!resourceStrings().contains(SizeButton::kContextStringSizeClear))
    resourceStrings().set(SizeButton::kContextStringSizeClear, L"Shrink the panel to its title");
}

// Every button is named after what it shows, so the tree dump and the log can tell them apart.
template <typename B>
B* named(B* b, const char* name) {
  b->set_name(name);
  return b;
}

constexpr int kGap = 16;
constexpr int kButtonW = 96;
constexpr int kButtonH = 26;

Button* pushButton(GalleryPage& page, int left, int top, const wchar_t* label, const char* msg,
                   const char* help) {
  Button* b = new Button(label, String(msg), page.place(left, top, kButtonW, kButtonH));
  b->set_name(Kw::toUtf8(label));
  b->setContextString(help);
  return b;
}

void buildPushButtons(GalleryPage& page, int top) {
  page.addCard("PUSH BUTTONS", 0, top, 4 * kButtonW + 5 * kGap, 184);
  const int row1 = top + 44, row2 = row1 + kButtonH + 14, row3 = row2 + kButtonH + 14;
  auto column = [](int i) { return kGap + i * (kButtonW + kGap); };

  pushButton(page, column(0), row1, L"Apply", "apply", "Sends \"apply\" when clicked");
  pushButton(page, column(1), row1, L"Mute", "mute",
             "Latches: \" on\" when pressed in, \" off\" when released")
      ->set_latching(true);
  pushButton(page, column(2), row1, L"Solo", "solo", "Latches, starting down")
      ->set_latching(true, true);
  pushButton(page, column(3), row1, L"Hold", "hold",
             "Pressure button: \" pressed\", \" dragged\", \" released\"")
      ->set_pressure_button(1);

  Button* nudge = pushButton(page, column(0), row2, L"Nudge +", "nudge", "Repeats while held down");
  nudge->set_repeating(10, 0.4);
  Button* record = pushButton(page, column(1), row2, L"Record", "record",
                              "Latching, with its own down caption and colours");
  record->set_latching(true);
  record->setDownString(L"Recording");
  record->set_downcols(Colour::fromHex(0xFFFFFF), Colour::fromHex(0xB8433A));
  Button* flat = pushButton(page, column(2), row2, L"Flat", "flat", "The flat style");
  flat->set_style(kButtonStyleFlat);
  pushButton(page, column(3), row2, L"Disabled", "disabled", "Inactive: takes no clicks")
      ->setActive(false, true);

  Button* left = pushButton(page, column(0), row3, L"Left aligned", "left", "Caption ranged left");
  left->set_ranged_left(1);
  Button* quiet = pushButton(page, column(1), row3, L"No hover", "no_hover",
                             "Does not brighten under the pointer");
  quiet->set_brightening(0);
  Button* shadowed =
      pushButton(page, column(2), row3, L"Shadowed", "shadowed", "Caption drawn with a shadow");
  shadowed->setTextStyle(Glib::TextStyles::Shadowed);
  shadowed->setcols(Colour::fromHex(0xFFFFFF), Colour::fromHex(0x3D8FD6));
  pushButton(page, column(3), row3, L"An overlong label that is clipped", "long",
             "A caption too long for its button is clipped");
}

void buildImageButtons(GalleryPage& page, int top) {
  const int x0 = 4 * kButtonW + 6 * kGap;
  page.addCard("IMAGE BUTTONS", x0, top, 360, 184);
  const int row1 = top + 44, row2 = row1 + kButtonH + 14;

  ImageButtonInitArgs gear(L"settings.png", L"settings.png", "settings",
                           page.place(x0 + kGap, row1, 120, kButtonH));
  gear.label = L"Settings";
  gear.settings.textAlignment = TextAlignment::Left;
  named(new ImageButton(gear), "Settings");

  ImageButtonInitArgs pin(L"pin.png", L"pinned.png", "pin",
                          page.place(x0 + kGap + 136, row1, 32, kButtonH));
  pin.settings.latching = kLatching;
  named(new ImageButton(pin), "Pin");

  const XY<int> natural = ImageButton::naturalSize(L"settings.png", L"");
  ImageButtonInitArgs bare(L"settings.png", L"", "bare",
                           page.place(x0 + kGap + 184, row1, natural.x, natural.y));
  bare.transparentBackground = true;
  named(new ImageButton(bare), "Transparent");

  // A picture found nowhere shows the placeholder.
  ImageButtonInitArgs missing(L"missing-icon.png", L"", "missing",
                              page.place(x0 + kGap, row2, 22, 22));
  named(new ImageButton(missing), "Missing picture");
}

// A panel's title strip: close, size, pin and settings from the right edge leftwards.
void buildTitleStrip(GalleryPage& page, int top) {
  const int width = 4 * kButtonW + 5 * kGap;
  page.addCard("PANEL TITLE STRIP", 0, top, width, 96);
  const int y = top + 52;
  int right = width - kGap;
  auto placeNext = [&](Button* b) {
    right -= b->width();
    const GlobCreationInfo at = page.place(right, y, b->width(), b->height());
    b->reshape_canvas(at.x, at.y, b->width(), b->height());
    right -= 4;
  };
  placeNext(named(new PootButton(20, 0, page.canvas()), "Close"));
  placeNext(named(new SizeButton(true, 20, 0, page.canvas()), "Size"));
  placeNext(named(new PinButton(16, 20, page.canvas()), "Pin panel"));
  placeNext(named(new SettingsButton(20, 0, page.canvas()), "Panel settings"));
}

}  // namespace

void buildButtonsPage(GalleryPage& page) {
  addGalleryIcons(page.getPalette());
  addSizeButtonStrings();
  const int top = GalleryPage::kContentTop;
  buildPushButtons(page, top);
  buildImageButtons(page, top);
  buildTitleStrip(page, top + 204);
}
