#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "gallery/GalleryPages.h"
#include "panels/ButtonGroup.h"
#include "panels/CheckableWidgetGroup.h"
#include "panels/CheckboxGroup.h"
#include "panels/LazyTabbedDialogue.h"
#include "panels/MinimizableGroup.h"
#include "panels/WidgetGroup2.h"
#include "platform/glob/GlobHandle.h"
#include "values/Slider.h"
#include "values/UnitDisplayer.h"
#include "values/VariBox.h"
#include "values/VariBoxParserBasic.h"

namespace {

constexpr int kGap = 16;

// The gallery page that `g` lies on, or null.
GalleryPage* pageOf(Glob* g) {
  for (; g; g = g->parent()) {
    if (auto* page = dynamic_cast<GalleryPage*>(g)) return page;
  }
  return nullptr;
}

// A group (or panel) that tells the page whatever its widgets report and it leaves alone, with
// the widget as the sender, so that the log shows the controls inside groups too. What the
// group answers itself (a grouped group's height change) stays with it; what it sends in turn
// goes to its parent as usual.
template <typename Base>
class Reporting : public Base {
 public:
  using Base::Base;

  int handleMessageEvent(const String& msg, Glob* sender) override {
    GlobHandle<> self(this);
    if (const int handled = Base::handleMessageEvent(msg, sender)) return handled;
    if (!self) return 1;
    if (GalleryPage* page = pageOf(this)) send_message_event(sender ? sender : this, page, msg);
    return 1;
  }
};

// What the value boxes of this page read and write through: whole decibels and percentages.
// An invisible child of the page, so that it lives as long as the boxes that borrow it.
class GroupsPageModel : public Glob {
 public:
  explicit GroupsPageModel(Canvas* page) : Glob(GlobCreationInfo(1, 1, page)) { unmap_canvas(); }
  UnitDisplayer<double> decibels{L" dB", 1};
  UnitDisplayer<double> ratio{L":1", 1};
  const char* idstring() const override { return "groupspagemodel"; }
};

Button* button(Glob& on, const wchar_t* label, const char* msg, int width = 90) {
  auto* b =
      new Button(label, msg, GlobCreationInfo(static_cast<unsigned short>(width), 22, on.canvas()));
  b->set_name(Kw::toUtf8(label));
  return b;
}

Checkbox* checkbox(Glob& on, const wchar_t* label, bool ticked, int width = 130) {
  auto* c =
      new Checkbox(GlobCreationInfo(static_cast<unsigned short>(width), 22, on.canvas()), ticked);
  c->setLabel(label);
  c->set_name(Kw::toUtf8(label));
  return c;
}

VariBox* valueBox(Glob& on, UnitDisplayer<double>& shown, double min, double max, double value,
                  const char* name) {
  VariBoxInitArgs args(GlobCreationInfo(
      110, static_cast<unsigned short>(VariBox::getDefaultHeight(VariBox::Compact)), on.canvas()));
  args.appearance = VariBox::Compact;
  auto* box = new VariBox(args);
  box->setParser(new VariBoxParserBasic<double>(box, &shown, min, max, 0.5, 3.0, value, 0.0), true);
  box->set_name(name);
  return box;
}

Slider* slider(Glob& on, int width, double position, const char* name) {
  SliderInitArgs args(GlobCreationInfo(static_cast<unsigned short>(width), 22, on.canvas()));
  args.position = position;
  auto* s = new Slider(args);
  s->set_name(name);
  return s;
}

// A channel: an outer minimisable group holding a minimisable input group, a checkable
// compressor and a plain group of stacked rows. Minimising the input moves the groups below it
// up, and the channel shrinks with it and says so to the page.
void buildNested(GalleryPage& page, GroupsPageModel& model, int top) {
  page.addCard("NESTED GROUPS: CLICK A TITLE TO MINIMISE IT", 0, top, 560, 436);
  auto* channel =
      new Reporting<MinimizableGroup>(page.place(kGap, top + 40, 528, 380), L"Channel 1");
  channel->setAutoSizeChildren(false);
  const int inner = 496;

  auto* input = new Reporting<MinimizableGroup>(
      GlobCreationInfo(inner, WidgetGroupEx::calcHeightForRows(2, 22, 8), channel->canvas()),
      L"Input");
  input->addWidget(button(*input, L"Phase", "phase"), XY<int>(8, 0), OriginInnerTopLeft);
  input->addWidget(checkbox(*input, L"Pad -20 dB", false), XY<int>(110, 0), OriginInnerTopLeft);
  input->addWidget(valueBox(*input, model.decibels, -24.0, 24.0, 0.0, "input trim"), XY<int>(8, 30),
                   OriginInnerTopLeft);
  input->addWidget(slider(*input, 240, 0.5, "input balance"), XY<int>(130, 30), OriginInnerTopLeft);
  channel->addWidget(input, XY<int>(8, 4), OriginInnerTopLeft);

  auto* comp = new Reporting<CheckableWidgetGroup>(
      GlobCreationInfo(inner, WidgetGroupEx::calcHeightForRows(2, 22, 8), channel->canvas()),
      L"Compressor", true);
  comp->setSeparatorStyle(WidgetGroupEx::SeparatorEtched);
  comp->addWidget(slider(*comp, 240, 0.4, "threshold"), XY<int>(8, 0), OriginInnerTopLeft);
  comp->addWidget(valueBox(*comp, model.ratio, 1.0, 20.0, 4.0, "ratio"), XY<int>(260, 0),
                  OriginInnerTopLeft);
  comp->addWidget(button(*comp, L"Reset", "reset"), XY<int>(8, 30), OriginInnerTopLeft);
  channel->addWidgetRelative(comp, input, 6, PlaceBelow, SurroundNone, AlignLeft);

  auto* output =
      new Reporting<WidgetGroup2>(GlobCreationInfo(inner, 40, channel->canvas()), L"Output");
  output->addRow(checkbox(*output, L"Mute", false));
  output->addRow(slider(*output, 300, 0.75, "output level"));
  output->addRow(button(*output, L"Solo", "solo"));
  channel->addWidgetRelative(output, comp, 6, PlaceBelow, SurroundNone, AlignLeft);
  channel->setAutoSize(true);
}

// A small dialogue of its own: its pages are built when first chosen and report what is
// pressed on them; a double click on the current tab renames it, and the "Sends" tab carries
// a check box.
class DemoTabs : public LazyTabbedDialogue {
 public:
  using LazyTabbedDialogue::LazyTabbedDialogue;

  void buildPage(const WString& pageId) override {
    Glob* base = getPageBaseGlob(pageId);
    if (!base) return;
    auto* sheet = new Reporting<StandardPanel>(
        GlobCreationInfo(static_cast<unsigned short>(base->width()),
                         static_cast<unsigned short>(base->height()), base->canvas()));
    sheet->setBorderStyle(UifBorderNone);
    sheet->set_name(Kw::toUtf8(pageId) + " sheet");
    const String id = Kw::toUtf8(pageId);
    sheet->addWidget(button(*sheet, (pageId + L" on").c_str(), (id + " on").c_str(), 120),
                     XY<int>(12, 12), OriginInnerTopLeft);
    sheet->addWidget(checkbox(*sheet, (pageId + L" to bus").c_str(), false, 160), XY<int>(12, 44),
                     OriginInnerTopLeft);
  }
};

void buildTabs(GalleryPage& page, int top) {
  const int x = 576;
  page.addCard("TABS: DOUBLE-CLICK THE CURRENT TAB TO RENAME IT", x, top, 424, 226);
  const XY<double> size = TabbedDialogue::calcSize(XY<double>(392, 130));
  auto* tabs = new DemoTabs(
      page.place(x + kGap, top + 40, static_cast<int>(size.x), static_cast<int>(size.y)));
  tabs->set_name("group tabs");
  for (const wchar_t* id : {L"Mix", L"Sends", L"Inserts"}) {
    tabs->addPageDeferred(id, kTabDefaultColour);
  }
  tabs->setCheckboxState(L"Sends", false);
}

// A group switched by the check box in its title, and one headed by a drop-down button.
void buildHeaded(GalleryPage& page, GroupsPageModel& model, int top) {
  const int x = 576;
  page.addCard("HEADED GROUPS", x, top, 424, 194);
  auto* limiter =
      new Reporting<CheckboxGroup>(page.place(x + kGap, top + 40, 392, 66), L"Limiter", true);
  limiter->setBoldWhenTicked(true);
  limiter->addWidget(valueBox(*limiter, model.decibels, -24.0, 0.0, -0.3, "ceiling"), XY<int>(8, 4),
                     OriginInnerTopLeft);
  limiter->addWidget(button(*limiter, L"Auditions", "audition"), XY<int>(130, 4),
                     OriginInnerTopLeft);

  auto* mode =
      new Reporting<ButtonGroup>(page.place(x + kGap, top + 116, 392, 66), L"Mode: Stereo");
  mode->addWidget(checkbox(*mode, L"Swap sides", false), XY<int>(8, 4), OriginInnerTopLeft);
  mode->addWidget(slider(*mode, 200, 0.5, "width"), XY<int>(150, 4), OriginInnerTopLeft);
}

}  // namespace

// Groups inside groups that follow each other's size, groups switched or headed by a control
// in their title, and a small tabbed dialogue whose tabs can be renamed and ticked.
void buildGroupsPage(GalleryPage& page) {
  auto* model = new GroupsPageModel(page.canvas());
  const int top = GalleryPage::kContentTop;
  buildNested(page, *model, top);
  buildTabs(page, top);
  buildHeaded(page, *model, top + 242);
}
