#include "gallery/GalleryPages.h"
#include "gallery/LevelMeter.h"
#include "gallery/ScrolledRows.h"
#include "gallery/SlidersPageModel.h"
#include "gallery/ZoomStrip.h"
#include "values/Slider.h"
#include "values/VariBox.h"

namespace {

constexpr int kGap = 16;

Slider* slider(GalleryPage& page, int left, int top, int w, int h, bool vertical, double pos,
               const char* name) {
  SliderInitArgs args(page.place(left, top, w, h), vertical);
  args.position = pos;
  auto* s = new Slider(args);
  s->set_name(name);
  return s;
}

void buildSliders(GalleryPage& page, int top) {
  page.addCard("SLIDERS", 0, top, 480, 200);
  const int y = top + 48;
  Slider* gain = slider(page, kGap, y, 340, 22, false, 0.3, "gain");
  gain->setPointOfInterest(0.75);  // a click beside the thumb jumps here
  Slider* pan = slider(page, kGap, y + 40, 340, 22, false, 0.5, "pan");
  pan->setValueRange(-1.0, 1.0);
  pan->setPosition(0.0);
  pan->setPointOfInterest(0.0);
  pan->setThumbColour(page.getPalette().get(Palette::Highlight));
  pan->setSynchronousMessages(true);
  Slider* off = slider(page, kGap, y + 80, 340, 22, false, 0.6, "unavailable");
  off->setActive(false, true);
  Slider* left = slider(page, 380, y - 4, 26, 136, true, 0.8, "level left");
  left->setPointOfInterest(0.5);
  slider(page, 420, y - 4, 26, 136, true, 0.4, "level right")
      ->setThumbColour(Colour::fromHex(0x3C9A5F));
}

void buildBoundLevel(GalleryPage& page, SlidersPageModel& model, int top) {
  const int x = 496;
  page.addCard("ONE VALUE, TWO VIEWS (TWICE)", x, top, 504, 200);
  const int y = top + 56;
  SliderInitArgs args(page.place(x + kGap, y, 300, 24));
  args.maxValue = 10.0;
  args.hasPointOfInterest = true;
  args.pointOfInterest = 5.0;
  auto* s = new Slider(args);
  s->set_name("level slider");
  model.bind(s);
  auto* meter = new LevelMeter(page.place(x + kGap, y + 48, 300, 24));
  meter->set_name("level meter");
  model.bind(meter);

  // The trim: a slider and a value box bound to one model value, either one moving the other.
  SliderInitArgs trimArgs(page.place(x + kGap, y + 96, 300, 24));
  auto* trim = new Slider(trimArgs);
  trim->set_name("trim slider");
  model.bindTrim(trim);
  VariBoxInitArgs boxArgs(
      page.place(x + kGap + 316, y + 97, 120, VariBox::getDefaultHeight(VariBox::Compact)));
  boxArgs.appearance = VariBox::Compact;
  auto* box = new VariBox(boxArgs);
  box->set_name("trim box");
  model.bindTrim(box);
}

void buildScrolled(GalleryPage& page, int top) {
  page.addCard("SCROLLED VIEW", 0, top, 480, 220);
  auto* rows = new ScrolledRows(page.place(kGap, top + 44, 300, 160), 40);
  rows->set_name("scrolled rows");
}

void buildZoom(GalleryPage& page, int top) {
  const int x = 496;
  page.addCard("ZOOM: DRAG THE THUMB'S ENDS", x, top, 504, 220);
  auto* zoom = new ZoomStrip(page.place(x + kGap, top + 60, 472, 64));
  zoom->set_name("zoom strip");
}

}  // namespace

// Sliders of both orientations, one level shown by a slider and a meter, a trim edited by a
// slider and a value box alike, a view scrolled by a
// scroll bar that it answers, and a zoom control made from a resizable thumb.
void buildSlidersPage(GalleryPage& page) {
  auto* model = new SlidersPageModel(page.canvas());
  const int top = GalleryPage::kContentTop;
  buildSliders(page, top);
  buildBoundLevel(page, *model, top);
  buildScrolled(page, top + 212);
  buildZoom(page, top + 212);
}
