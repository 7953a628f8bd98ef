#include <ios>

#include "gallery/GalleryPages.h"
#include "gallery/LevelMeter.h"
#include "gallery/ValuesPageModel.h"
#include "platform/glib/look/ValueBoxLook.h"
#include "values/TitledVariBox.h"
#include "values/VariBoxParserBasic.h"
#include "values/VariBoxParserLog.h"

namespace {

constexpr int kGap = 16;
constexpr int kTitleW = 104;
constexpr int kBoxW = 166;
constexpr int kRowStep = 36;

// A titled value box on the page, `left` across and `top` down, with a parser made for it.
template <typename MakeParser>
TitledVariBox* titled(GalleryPage& page, int left, int top, const wchar_t* title,
                      VariBox::eAppearance appearance, MakeParser make) {
  const int h = VariBox::getDefaultHeight(appearance);
  auto* t = new TitledVariBox(title, L"", Glib::ValueBoxLook(page.getPalette()).thermometer(),
                              kTitleW, kBoxW, appearance, page.canvas());
  const GlobCreationInfo at = page.place(left, top, kTitleW + kBoxW, h);
  t->translate_canvas(at.x, at.y);
  t->set_name(Kw::toUtf8(title));
  t->setParser(make(t->getVariBox()), true);
  return t;
}

void buildLinear(GalleryPage& page, ValuesPageModel& m, int top) {
  page.addCard("LINEAR", 0, top, 320, 190);
  const int x = kGap;
  int y = top + 40;
  titled(page, x, y, L"Frames (int)", VariBox::Standard, [&](VariBox* b) {
    return new VariBoxParserBasic<int>(b, &m.frames, -250, 250, 1, 25, 0, 0);
  });
  y += kRowStep;
  titled(page, x, y, L"Takes (uint)", VariBox::Compact, [&](VariBox* b) {
    return new VariBoxParserBasic<unsigned>(b, &m.count, 1, 99, 1, 10, 12, 0);
  });
  y += kRowStep;
  titled(page, x, y, L"Gain (float)", VariBox::Compact, [&](VariBox* b) {
    return new VariBoxParserBasic<float>(b, &m.gain, 0.0f, 2.0f, 0.01f, 0.1f, 1.0f, 0.0f);
  });
  y += kRowStep;
  titled(page, x, y, L"Offset (double)", VariBox::Flat, [&](VariBox* b) {
    return new VariBoxParserBasic<double>(b, &m.seconds, -10.0, 10.0, 0.001, 0.1, 1.5, 0.0);
  });
}

void buildLogarithmic(GalleryPage& page, int top) {
  const int left = 336;
  page.addCard("LOGARITHMIC", left, top, 320, 190);
  const int x = left + kGap;
  int y = top + 40;
  const int fixed = std::ios_base::fixed;
  titled(page, x, y, L"Samples (int)", VariBox::Standard, [](VariBox* b) {
    return new VariBoxParserLog<int>(b, 0, 48000, 0.005, 0.05, 480, 0, 6, 0, -1, -1);
  });
  y += kRowStep;
  titled(page, x, y, L"Freq Hz (uint)", VariBox::Compact, [](VariBox* b) {
    return new VariBoxParserLog<unsigned>(b, 20, 20000, 0.005, 0.05, 1000, 0, 6, 0, -1, -1);
  });
  y += kRowStep;
  titled(page, x, y, L"Mix (float)", VariBox::Compact, [fixed](VariBox* b) {
    return new VariBoxParserLog<float>(b, 0.0f, 1.0f, 0.005, 0.05, 0.25f, 0.0f, 6, fixed, -1, 3);
  });
  y += kRowStep;
  titled(page, x, y, L"Time s (double)", VariBox::Flat, [fixed](VariBox* b) {
    return new VariBoxParserLog<double>(b, 0.001, 60.0, 0.005, 0.05, 2.0, 0.0, 9, fixed, -1, 3);
  });
}

void buildSharedLevel(GalleryPage& page, ValuesPageModel& m, int top) {
  const int left = 672;
  page.addCard("ONE LEVEL, THREE VIEWS", left, top, 328, 190);
  const int x = left + kGap;
  int y = top + 40;
  const int v = m.level().getValue();
  titled(page, x, y, L"Level", VariBox::Standard, [&](VariBox* b) {
    auto* p = new VariBoxParserBasic<int>(b, &m.whole, 0, ValuesPageModel::kLevelMax, 1, 1, v, 0);
    p->setDataAdaptor(m.levelAdaptor());
    return p;
  });
  y += kRowStep;
  titled(page, x, y, L"Level %", VariBox::Compact, [&](VariBox* b) {
    auto* p =
        new VariBoxParserBasic<int>(b, &m.percent, 0, ValuesPageModel::kLevelMax, 1, 1, v, 10);
    p->setDataAdaptor(m.levelAdaptor());
    return p;
  });
  y += kRowStep + 4;
  auto* meter = new LevelMeter(page.place(x, y, kTitleW + kBoxW, 22));
  meter->set_name("level meter");
  meter->setDataAdaptor(m.levelAdaptor());
  int shown = m.level().getValue();
  meter->setNewWidgetValue(shown);
}

}  // namespace

// Value boxes of every type on linear and logarithmic parsers, and one model level shown by two
// value boxes and a meter; the log shows the boxes' messages and the change type of every
// request the level's adaptor hears, so a drag reads 0, 1, ..., 2.
void buildValuesPage(GalleryPage& page) {
  auto* model = new ValuesPageModel(page.canvas());
  const int top = GalleryPage::kContentTop;
  buildLinear(page, *model, top);
  buildLogarithmic(page, top);
  buildSharedLevel(page, *model, top);
}
