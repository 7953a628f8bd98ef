#include "gallery/GalleryPages.h"
#include "panels/StandardPanel.h"
#include "text/TextBox.h"

namespace {

constexpr int kCardWidth = 230;
constexpr int kCardHeight = 80;
constexpr int kGap = 16;
constexpr int kBoxInset = 12;
constexpr int kBoxTop = 42;  // below the card's title

// Every callback event of the box goes to the page, and so to the message log.
void reportTo(GalleryPage& page, TextBox& box) {
  static const char* const kNames[] = {"focus gained", "focus lost after a change",
                                       "text changed by a key", "Enter", "second click"};
  for (int event = 0; event < 5; ++event) {
    box.requestCallback(kNames[event], &page, static_cast<TextBoxBase::CallbackEvent>(event));
  }
}

TextBox* addBoxCard(GalleryPage& page, int column, int row, const String& title, const String& name,
                    TextBox::InitArgs args) {
  const int left = column * (kCardWidth + kGap);
  const int top = GalleryPage::kContentTop + row * (kCardHeight + kGap);
  page.addCard(title, left, top, kCardWidth, kCardHeight);
  args.info = page.place(left + kBoxInset, top + kBoxTop, kCardWidth - 2 * kBoxInset, 24);
  auto* box = new TextBox(args);
  box->set_name(name);
  box->setContextString("A text box: " + title + "\nEvery callback it raises shows in the log");
  reportTo(page, *box);
  return box;
}

}  // namespace

// The single-line text box in its variants, each in its own card; every callback event they
// raise shows in the message log. A panel below has an editable title box.
void buildTextPage(GalleryPage& page) {
  TextBox::InitArgs plain;
  plain.text = L"Scene 12, take 3";
  addBoxCard(page, 0, 0, "EDITABLE", "editable", plain);

  TextBox::InitArgs readOnly;
  readOnly.text = L"Read-only: click twice";
  readOnly.editable = false;
  addBoxCard(page, 1, 0, "READ-ONLY", "read-only", readOnly);

  TextBox::InitArgs limited;
  limited.sizeLimit = 8;
  limited.ghostLabel = L"At most 8 characters";
  addBoxCard(page, 2, 0, "SIZE LIMIT 8", "limited", limited);

  TextBox::InitArgs digits;
  digits.characters = L"0123456789";
  digits.restriction = TextBoxBase::OnlyListed;
  digits.alignment = TextAlignment::Right;
  digits.text = L"2024";
  addBoxCard(page, 3, 0, "DIGITS ONLY", "digits", digits);

  TextBox::InitArgs hex;
  hex.characters = L"0123456789ABCDEF";
  hex.restriction = TextBoxBase::OnlyListed;
  hex.ghostLabel = L"Hex digits, upper case";
  addBoxCard(page, 0, 1, "HEX", "hex", hex);

  TextBox::InitArgs password;
  password.obfuscated = true;
  password.text = L"secret";
  addBoxCard(page, 1, 1, "PASSWORD", "password", password);

  TextBox::InitArgs ghost;
  ghost.ghostLabel = L"Search clips";
  addBoxCard(page, 2, 1, "GHOST LABEL", "search", ghost);

  TextBox::InitArgs centred;
  centred.text = L"Centred";
  centred.alignment = TextAlignment::Centred;
  addBoxCard(page, 3, 1, "CENTRED", "centred", centred);

  const int top = GalleryPage::kContentTop + 2 * (kCardHeight + kGap);
  page.addCard("PANEL WITH AN EDITABLE TITLE", 0, top, 2 * kCardWidth + kGap, 150);
  auto* panel = new StandardPanel(page.place(kBoxInset, top + kBoxTop, 2 * kCardWidth - 8, 90));
  panel->setBorderStyle(UifBorderRaised);
  panel->setTitle(L"Click to rename, Enter to keep");
  panel->addStandardWidgets(StdEditableTitleBox);
  panel->setContextString("Click the title to rename the panel; Enter keeps the new name");
}
