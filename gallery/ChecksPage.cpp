#include "buttons/CheckboxRadioSet.h"
#include "buttons/RadioSet.h"
#include "gallery/ChecksPageModel.h"
#include "gallery/GalleryPages.h"

namespace {

constexpr int kGap = 16;
constexpr int kRowH = 20;
constexpr int kRowStep = 28;

template <typename Box = Checkbox>
Box* box(GalleryPage& page, int left, int top, int width, const wchar_t* label, bool ticked) {
  auto* b = new Box(page.place(left, top, width, kRowH), ticked);
  b->setLabel(label);
  b->set_name(Kw::toUtf8(label));
  return b;
}

void buildBoundBoxes(GalleryPage& page, ChecksPageModel& model, int top) {
  page.addCard("ONE VALUE, FOUR VIEWS", 0, top, 320, 200);
  const int y = top + 44;
  model.bind(box(page, kGap, y, 200, L"Loop playback", false));
  Checkbox* toggle = box(page, kGap, y + kRowStep, 200, L"Loop playback", false);
  toggle->setAppearance(Checkbox::FlatToggle);
  model.bind(toggle);
  // The same value once more, as a pair of boxes exactly one of which is ticked.
  Checkbox* on = box(page, kGap, y + 2 * kRowStep + 8, 120, L"Loop on", false);
  Checkbox* off = box(page, kGap + 140, y + 2 * kRowStep + 8, 120, L"Loop off", true);
  on->setMsgPrefix("loop on", false);
  off->setMsgPrefix("loop off", false);
  model.loopPair().setWidgets(on, off, model.loop().getValue());
  Checkbox* right = box(page, kGap, y + 3 * kRowStep + 16, 200, L"Label left of the box", false);
  right->setAppearance(Checkbox::BoxRight);
  right->setMsgPrefix("label left ", true);
}

void buildTriState(GalleryPage& page, ChecksPageModel& model, int top) {
  const int x = 336;
  page.addCard("TRI-STATE AND BEHAVIOUR", x, top, 320, 200);
  const int y = top + 44;
  auto* all = box<TriStateBox>(page, x + kGap, y, 200, L"All tracks", false);
  all->setMsgPrefix("all tracks ", true);
  Checkbox* drums = box(page, x + kGap + 20, y + kRowStep, 180, L"Drums", true);
  Checkbox* bass = box(page, x + kGap + 20, y + 2 * kRowStep, 180, L"Bass", false);
  drums->setMsgPrefix("drums ", true);
  bass->setMsgPrefix("bass ", true);
  model.setAllBox(all, drums, bass);

  Checkbox* release = box(page, x + kGap, y + 3 * kRowStep + 8, 140, L"On release", false);
  release->setMessageGeneration(Checkbox::GenerateOnRelease);
  release->setMsgPrefix("release ", true);
  release->setTickCharacter('x');
  Checkbox* bold = box(page, x + kGap + 150, y + 3 * kRowStep + 8, 140, L"Bold ticked", true);
  bold->setBoldWhenTicked(true);
  // The warm caret colour of the palette, so that it reads on dark and pale panels.
  bold->setTextColourWhenTicked(page.getPalette().get(Palette::Caret));
  bold->setMsgPrefix("bold ", true);
  box(page, x + kGap, y + 4 * kRowStep + 8, 200, L"Unavailable", true)->setActive(false, true);
}

void buildRadioSets(GalleryPage& page, ChecksPageModel& model, int top) {
  page.addCard("RADIO SETS", 0, top, 1000, 176);
  const int y = top + 44;
  auto* edit = new RadioSet({L"Cut", L"Copy", L"Paste"}, page.place(kGap, y, 300, 26));
  edit->set_name("edit mode");
  auto* direction = new RadioSet({L"In", L"Out", L"Both"}, page.place(kGap + 320, y, 90, 120));
  direction->setBorderStyle(UifBorderSunken);
  direction->setSelectedItem(2);
  direction->set_name("direction");

  auto* channels = new CheckboxRadioSet(page.place(kGap + 440, y, 160, 70));
  channels->addWidgets({UIString("Mono"), UIString("Stereo"), UIString("Surround")});
  channels->setSelectedItem(1);
  channels->setBoldWhenTicked(true);
  channels->set_name("channels");

  // A managed row: each member reports its bare prefix when chosen.
  const wchar_t* levels[] = {L"Low", L"Mid", L"High"};
  const char* prefixes[] = {"quality low", "quality mid", "quality high"};
  for (int i = 0; i < 3; ++i) {
    auto* member = box<RadioSetCheckbox>(page, kGap + 620 + 110 * i, y, 100, levels[i], i == 1);
    member->setAppearance(Checkbox::FlatToggle);
    member->setMsgPrefix(prefixes[i], false);
    model.quality().add(member);
  }
}

}  // namespace

// Check boxes bound to one model value beside a second view of it, a tri-state box, and each
// kind of radio set; what each sends shows in the message log.
void buildChecksPage(GalleryPage& page) {
  auto* model = new ChecksPageModel(page.canvas());
  const int top = GalleryPage::kContentTop;
  buildBoundBoxes(page, *model, top);
  buildTriState(page, *model, top);
  buildRadioSets(page, *model, top + 216);
}
