#include "gallery/GalleryPages.h"
#include "gallery/LabelBindingDemo.h"
#include "text/TextLabel.h"
#include "text/TitleTextBox.h"

namespace {

constexpr int kGap = 16;
constexpr int kCardW = 484;
constexpr int kInset = 16;
constexpr int kBelowTitle = 44;

void buildBinding(GalleryPage& page, int top) {
  page.addCard("LABELS BOUND TO ONE VALUE", 0, top, kCardW, 200);
  auto* demo =
      new LabelBindingDemo(page.place(kInset, top + kBelowTitle, kCardW - 2 * kInset, 140));
  demo->set_name("label binding");
}

void buildTitledBoxes(GalleryPage& page, int top) {
  const int left = kCardW + kGap;
  page.addCard("TITLED TEXT BOXES", left, top, kCardW, 200);
  struct Row {
    const wchar_t* title;
    TitleTextBox::eStyle style;
    const wchar_t* text;
    const char* help;
    int y;
  };
  const Row rows[] = {
      {L"Reel", TitleTextBox::StyleBeside, L"A014", "Style 0: the title beside the box", 0},
      {L"Scene", TitleTextBox::StyleTab, L"12", "Style 1: the title on a tab joined to the box",
       38},
      {L"Take", TitleTextBox::StyleAbove, L"", "Style 2: the title above the box", 76},
  };
  for (const Row& r : rows) {
    TitleTextBoxInitArgs args;
    args.info = page.place(left + kInset, top + kBelowTitle + r.y, 0, 0);
    args.title = r.title;
    args.titleWidth = r.style == TitleTextBox::StyleTab ? 0 : 60;
    args.boxWidth = 200;
    args.style = r.style;
    args.box.text = r.text;
    args.box.ghostLabel = L"Next take";
    auto* box = new TitleTextBox(args);
    box->set_name(Kw::toUtf8(r.title));
    box->setContextString(r.help);
    box->requestCallback(Kw::toUtf8(r.title) + " entered", nullptr, TextBoxBase::EnterPressed);
  }
  TitleTextBoxInitArgs off;
  off.info = page.place(left + kInset + 230, top + kBelowTitle + 97, 0, 0);
  off.title = L"Locked";
  off.titleWidth = 50;
  off.boxWidth = 150;
  off.box.text = L"read only";
  off.box.editable = false;
  auto* locked = new TitleTextBox(off);
  locked->set_name("Locked");
  locked->setContextString("A titled box that is not editable");
}

void buildTooltipNote(GalleryPage& page, int top) {
  page.addCard("TOOLTIPS", 0, top, 2 * kCardW + kGap, 100);
  auto* note = new TextLabel(
      L"Rest the pointer on any control of any page for 300 ms: its help "
      L"shows below the pointer for up to five seconds.",
      page.getPalette(), 0, false, page.canvas());
  const GlobCreationInfo at = page.place(kInset, top + kBelowTitle, note->width(), note->height());
  note->reshape_canvas(at.x, at.y, note->width(), note->height());
  note->set_name("tooltip note");
  note->setContextString(
      "A tooltip of several lines:\nline breaks start new lines,\nand the tooltip keeps on the "
      "screen.");
}

}  // namespace

// Labels bound to a value, titled boxes in each style, the input box and tooltips.
void buildLabelsPage(GalleryPage& page) {
  const int top = GalleryPage::kContentTop;
  buildBinding(page, top);
  buildTitledBoxes(page, top);
  buildTooltipNote(page, top + 216);
}
