// The drop-downs page: drop-down buttons (grouped entries, a disabled and a wheel-skipped
// entry, an add entry, pictures), combo boxes (numeric with a suffix, titled) and a menu-button
// group, each bound to a model value that a line of text elsewhere on the page shows.
#include "buttons/ImageSearchPath.h"
#include "dropdowns/ComboBox.h"
#include "dropdowns/DropDownButtonImposter.h"
#include "dropdowns/DropDownChoices.h"
#include "dropdowns/DropDownImageButton.h"
#include "dropdowns/MenuWithAddButton.h"
#include "dropdowns/TitleMenuButton.h"
#include "dropdowns/TitledComboBox.h"
#include "foundation/ValServerAdaptor.h"
#include "gallery/GalleryPages.h"
#include "panels/MenuButtonGroup.h"
#include "platform/glob/GlobHandle.h"
#include "text/TextLabel.h"

namespace {

constexpr int kGap = 16;
constexpr int kRow = 32;

// The models of the page and the glue between them and the controls. It lies over the page's
// content, draws nothing, and is the parent of the controls: it takes what it needs from their
// messages and passes every message on to the page with the control as sender, so the log
// shows them as usual.
class DropDownsPageModel : public Glob, public ValClient<int> {
 public:
  explicit DropDownsPageModel(const GlobCreationInfo& info)
      : Glob(info), colourAdaptor_(new ValServerAdaptor<int>(&colour_)) {
    registerWith(&colour_);
  }

  ValServer<int>& colour() { return colour_; }
  Kw::Ptr<ValAdaptorBase<int>> colourAdaptor() {
    return Kw::Ptr<ValAdaptorBase<int>>(colourAdaptor_);
  }

  GlobHandle<DropDownMenuButton> colourTwin;  // a second view of the colour
  GlobHandle<DropDownMenuButton> track;
  GlobHandle<DropDownMenuButton> preset;
  GlobHandle<ComboBox> gain;
  GlobHandle<TitledComboBox> rate;
  GlobHandle<MenuButtonGroup> view;
  GlobHandle<TextLabel> status[3];
  int presetCount = 3;

  void valChangedNtfy() override {
    if (DropDownMenuButton* twin = colourTwin.get()) twin->setSelectedItem(colour_.getValue());
    show();
  }

  // Writes what the models hold into the status lines.
  void show() {
    auto name = [](const DropDownMenuButton* b) {
      return b ? b->getSelectedItemNameW() + L" (" + std::to_wstring(b->getSelectedItem()) + L")"
               : WString();
    };
    if (TextLabel* l = status[0].get()) {
      l->setText(L"Model: colour " + std::to_wstring(colour_.getValue()) + L", track " +
                 name(track.get()) + L", preset " + name(preset.get()));
    }
    if (TextLabel* l = status[1].get()) {
      const TitledComboBox* r = rate.get();
      l->setText(L"Model: gain " + std::to_wstring(gain_) + L" %, rate " +
                 (r ? r->getString() : WString()) +
                 (r && r->isSelectedCustom() ? L" (typed, not a choice)" : L""));
    }
    if (TextLabel* l = status[2].get()) {
      const MenuButtonGroup* g = view.get();
      l->setText(L"Model: view " + (g ? g->getSelectedItemNameW() : WString()));
    }
  }

  int react(Event* e) override {
    if (!message_event(e)) return Glob::react(e);
    Glob* sender = event_to_sender_glob(e);
    const String msg = e->text();
    GlobHandle<> self(this);
    if (msg == MenuWithAddButton::AddMsg_ && sender == preset.get()) addPreset();
    if (msg == DropDownMenuButton::dropDownMenuButtonMsg && sender == gain.get()) {
      gain_ = gain->getAsInt();
    }
    show();
    if (Glob* page = parent(); page && self) send_message_event(sender ? sender : this, page, msg);
    return 1;
  }
  const char* idstring() const override { return "dropdownspagemodel"; }

 private:
  void addPreset() {
    DropDownMenuButton* p = preset.get();
    if (!p) return;
    std::vector<MenuItem> items = p->menuData().items;
    items.emplace_back(L"Preset " + std::to_wstring(++presetCount), "");
    p->setStrings(items);
    p->setSelectedItem(static_cast<int>(items.size()) - 1);
  }

  ValServer<int> colour_{1};
  Kw::Ptr<ValServerAdaptor<int>> colourAdaptor_;
  int gain_ = 42;
};

TextLabel* statusLine(DropDownsPageModel& m, const char* name, int x, int y, int w) {
  auto* l = new TextLabel(L"", m.getPalette(), 0, false, m.canvas());
  l->reshape_canvas(x, y, w, 20);
  l->set_name(name);
  return l;
}

// Positions inside the model, which covers the page below the heading: `top` is measured down
// from the top of the content.
GlobCreationInfo at(DropDownsPageModel& m, int left, int top, int w, int h) {
  return GlobCreationInfo(static_cast<unsigned short>(w), static_cast<unsigned short>(h),
                          m.canvas(), left, m.height() - top - h);
}

void buildDropDowns(DropDownsPageModel& m, int x, int top) {
  int y = top + 44;
  auto* colour = new TitleMenuButton(L"Colour", {L"Red", L"Green", L"Blue", L"Black"},
                                     at(m, x + kGap, y, 260, 24));
  colour->setDataAdaptor(m.colourAdaptor());
  m.colourAdaptor()->forceWidgetUpdate();
  auto* twin = new DropDownMenuButton(L"Colour", {L"Red", L"Green", L"Blue", L"Black"},
                                      at(m, x + kGap + 276, y, 140, 24));
  twin->set_name("Colour (not bound)");
  twin->setSelectedItem(m.colour().getValue());
  m.colourTwin = GlobHandle<DropDownMenuButton>(twin);

  y += kRow;
  std::vector<MenuItem> tracks;
  tracks.emplace_back(L"Audio", "", ExpandedGroupItem);
  for (const wchar_t* t : {L"Vocals", L"Drums", L"Bass"})
    tracks.emplace_back(t, "", GroupedMenuItem);
  tracks.emplace_back(L"MIDI", "", ExpandedGroupItem);
  for (const wchar_t* t : {L"Piano", L"Strings"}) tracks.emplace_back(t, "", GroupedMenuItem);
  tracks.emplace_back(L"Busses", "", CompressedGroupItem);
  tracks.emplace_back(L"Bus A (offline)", "", GroupedMenuItem);
  tracks.back().setActive(false);
  tracks.emplace_back(L"Master (wheel skips it)", "", GroupedMenuItem);
  tracks.back().setFlags(MenuItem::kActive | DropDownChoices::kNoStepFlag);
  DDBtnInitArgs args;
  static_cast<GlobCreationInfo&>(args) = at(m, x + kGap, y, 260, 24);
  args.label = L"Track";
  args.items = tracks;
  args.dropDown.prefsKey = "Gallery drop-down tracks";
  args.dropDown.drawSeparator = true;
  auto* track = new DropDownMenuButton(args);
  track->set_name("Track");
  track->setContextString(
      "Grouped entries; the wheel steps them but skips the offline bus and the master");
  m.track = GlobHandle<DropDownMenuButton>(track);

  y += kRow;
  auto* preset = new DropDownMenuButton(L"Preset", {L"Preset 1", L"Preset 2", L"Preset 3"},
                                        at(m, x + kGap, y, 260, 24));
  preset->setAddEntry(true, L"Add a preset");
  preset->set_name("Preset");
  m.preset = GlobHandle<DropDownMenuButton>(preset);

  y += kRow;
  auto* pictures = new DropDownImageButton({{L"Pin", "pin.png"}, {L"Settings", "settings.png"}},
                                           at(m, x + kGap, y, 140, 24));
  pictures->set_name("Picture drop-down");
  auto* off = new DropDownMenuButton(L"Disabled", {L"Nothing"}, at(m, x + kGap + 156, y, 120, 24));
  off->setActive(false, false);
  auto* imposter =
      new DropDownButtonImposter(L"Imposter", "imposter", at(m, x + kGap + 292, y, 124, 24));
  imposter->setDrawSeparator(true);

  m.status[0] = GlobHandle<TextLabel>(
      statusLine(m, "Drop-down values", x + kGap, m.height() - (y + kRow + 20), 440));
}

void buildCombos(DropDownsPageModel& m, int x, int top) {
  int y = top + 44;
  auto* gain = new ComboBox(L"", {L"0", L"25", L"50", L"75", L"100"}, at(m, x + kGap, y, 140, 24));
  gain->setNumericEntry(true, 0, 100);
  gain->setSuffix(L" %");
  gain->setString(L"42");
  gain->set_name("Gain");
  gain->setContextString("Type a number from 0 to 100, or turn the wheel over it");
  m.gain = GlobHandle<ComboBox>(gain);

  y += kRow + 8;
  TitledComboBoxInitArgs a;
  a.info = at(m, x + kGap, y, 300, 24);
  a.title = L"Sample rate";
  a.choices = {L"44100", L"48000", L"96000"};
  auto* rate = new TitledComboBox(a);
  rate->setNumericEntry(true, 8000, 192000);
  m.rate = GlobHandle<TitledComboBox>(rate);

  m.status[1] = GlobHandle<TextLabel>(
      statusLine(m, "Combo values", x + kGap, m.height() - (y + kRow + 20), 440));
}

void buildGroup(DropDownsPageModel& m, int x, int top) {
  auto* g = new MenuButtonGroup(at(m, x + kGap, top + 40, 440, 96), L"View",
                                {L"Waveform", L"Spectrum", L"Both, side by side"});
  g->setDrawButtonSeparator(true);
  g->set_name("View group");
  auto* hint = new TextLabel(L"The group's button chooses what it shows", g->getPalette(), 0, false,
                             g->canvas());
  hint->reshape_canvas(12, 24, 360, 20);
  m.view = GlobHandle<MenuButtonGroup>(g);
  m.status[2] =
      GlobHandle<TextLabel>(statusLine(m, "Group value", x + kGap, m.height() - (top + 164), 440));
}

}  // namespace

void buildDropDownsPage(GalleryPage& page) {
#ifdef GLOBKIT_GALLERY_ICONS
  imageSearchPath().addDirectory(GLOBKIT_GALLERY_ICONS);
#endif
  imageSearchPath().addDirectory("gallery/icons");

  const int contentHeight = GalleryPage::kHeight - GalleryPage::kContentTop;
  auto* m = new DropDownsPageModel(
      page.place(0, GalleryPage::kContentTop, GalleryPage::kWidth, contentHeight));
  m->set_name("Drop-downs model");
  m->setContextString("Drop-downs and combo boxes; the lines of text show the model values");
  page.addCard("DROP-DOWN BUTTONS", 0, GalleryPage::kContentTop, 480, 220);
  page.addCard("COMBO BOXES", 500, GalleryPage::kContentTop, 480, 160);
  page.addCard("MENU-BUTTON GROUP", 500, GalleryPage::kContentTop + 176, 480, 200);
  buildDropDowns(*m, 0, 0);
  buildCombos(*m, 500, 0);
  buildGroup(*m, 500, 176);
  m->show();
}
