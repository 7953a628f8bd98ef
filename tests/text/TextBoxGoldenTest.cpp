// The text box's look, one golden image per state: focus with the caret, a selection, the
// overwrite caret, obfuscated text and the ghost label.
#include "platform/testing/GoldenImage.h"
#include "tests/text/TextBoxTestSupport.h"

namespace {

TextBox* boxOn(Harness& h, const WString& text, TextBox::InitArgs args = {}) {
  args.info = h.place(10, 10, 160, 24);
  args.text = text;
  return new TextBox(args);
}

}  // namespace

TEST(TextBoxLook, FocusSelectionAndOverwriteCaret) {
  Harness h(180, 44);
  TextBox* box = boxOn(h, L"Clip 12 take 3");
  box->set_kbd_focus();
  h.key(kKeyEnd);
  EXPECT_TRUE(GoldenImage::check(h, *box, "textbox_focus"));

  box->setSelection(NumRange<int, true>(8, 12));
  EXPECT_TRUE(GoldenImage::check(h, *box, "textbox_selection"));

  box->setEditMode(TextBoxBase::EditOverwrite);
  box->setCursorPosition(static_cast<unsigned short>(5));
  EXPECT_TRUE(GoldenImage::check(h, *box, "textbox_overwrite"));
}

TEST(TextBoxLook, ObfuscatedTextAndGhostLabel) {
  Harness h(180, 44);
  TextBox::InitArgs args;
  args.obfuscated = true;
  TextBox* box = boxOn(h, L"secret", args);
  EXPECT_TRUE(GoldenImage::check(h, *box, "textbox_obfuscated"));

  box->setText(L"");
  box->setGhostLabel(L"Search clips");
  EXPECT_TRUE(GoldenImage::check(h, *box, "textbox_ghost"));
}
