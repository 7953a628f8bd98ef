#include "text/InputBox.h"

#include <algorithm>

#include "platform/glob/RootGlob.h"
#include "platform/glob/WindowPlacement.h"
#include "platform/misc/Diagnostics.h"
#include "text/TextBox.h"
#include "text/TextLabel.h"

namespace {

constexpr int kInset = 6;  // between the border, the prompt and the entry
constexpr int kEntryHeight = 22;

}  // namespace

const char* const InputBox::returnPressedMsg = "LinecanvasReturnPressed";
GlobHandle<InputBox> InputBox::current_;

InputBox::InputBox(const WString& title, const WString& prompt, const WString& text,
                   const String& message, Glob* requester, bool hideText, const Palette& palette)
    : StandardPanel(XY<int>(kWidth, kHeight), palette, false, nullptr),
      requester_(requester),
      message_(message) {
  setTitle(title);
  build(prompt, text, hideText);
}

InputBox::InputBox(const Colour& colour, const WString& prompt, const WString& text,
                   const String& message, Glob* requester, bool hideText, const Palette& palette)
    : StandardPanel(XY<int>(kWidth, kHeight), palette, false, nullptr),
      requester_(requester),
      message_(message) {
  setCol(colour, false);
  build(prompt, text, hideText);
}

InputBox::~InputBox() {
  if (current_.refersTo(this)) current_.reset();
}

void InputBox::build(const WString& prompt, const WString& text, bool hideText) {
  setBorderStyle(UifBorderRaised);
  addStandardWidgets(StdPootButton | StdDoItButton);
  const Kw::Box<int> area = getUserArea();

  prompt_ = new TextLabel(prompt, getPalette(), 0, false, canvas());
  prompt_->set_name("prompt");
  const int promptW = std::min<int>(prompt_->width(), area.width() / 2);
  if (promptW < prompt_->width())
    prompt_->fixSize(static_cast<unsigned short>(promptW), prompt_->height());
  addWidget(prompt_, kInset, (area.height() - prompt_->height()) / 2, OriginInnerBottomLeft);

  const int entryX = kInset + promptW + (prompt.empty() ? 0 : kInset);
  TextBox::InitArgs args;
  args.info =
      GlobCreationInfo(static_cast<unsigned short>(std::max(1, area.width() - entryX - kInset)),
                       kEntryHeight, canvas());
  args.info.palette = getPalette();
  args.text = text;
  args.obfuscated = hideText;
  entry_ = new TextBox(args);
  entry_->set_name("entry");
  entry_->requestCallback(returnPressedMsg, this, TextBoxBase::EnterPressed);
  addWidget(entry_, entryX, (area.height() - kEntryHeight) / 2, OriginInnerBottomLeft);
}

// --- Making and removing ---

RootGlob* InputBox::prepare(Glob* requester) {
  removeAnyExistingInputBox();
  RootGlob* screen = is_good_glob_ptr(requester) ? requester->root() : nullptr;
  if (!screen) diagWarning("InputBox: the requester is on no screen, no box made\n");
  return screen;
}

InputBox* InputBox::make(const WString& title, const WString& prompt, const WString& text,
                         const String& message, Glob* requester, bool hideText) {
  RootGlob* screen = prepare(requester);
  if (!screen) return nullptr;
  return show(
      new InputBox(title, prompt, text, message, requester, hideText, requester->getPalette()),
      *screen);
}

InputBox* InputBox::make(const Colour& colour, const WString& prompt, const WString& text,
                         const String& message, Glob* requester, bool hideText) {
  RootGlob* screen = prepare(requester);
  if (!screen) return nullptr;
  return show(
      new InputBox(colour, prompt, text, message, requester, hideText, requester->getPalette()),
      *screen);
}

InputBox* InputBox::show(InputBox* box, RootGlob& screen) {
  const XY<int> size(kWidth, kHeight);
  screen.adopt(box, WindowPlacement::propose(screen, size));
  current_ = box;
  GlobHandle<InputBox> alive(box);
  box->setModal(true);
  if (alive) box->entry_->set_kbd_focus();
  return alive.get();
}

void InputBox::removeAnyExistingInputBox() {
  if (InputBox* old = current_.get()) delete old;
  current_.reset();
}

// --- Answering ---

WString InputBox::getString() const {
  return entry_->getString();
}

void InputBox::do_act() {
  if (done_) return;
  done_ = true;
  const String answer = message_ + Kw::toUtf8(getString());
  if (Glob* r = requester_.get()) send_msg(r, answer.c_str());
  send_msg(this, "poot");
}

int InputBox::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg == doItMsg || msg == returnPressedMsg) {
    do_act();
    return 1;
  }
  return 0;
}

bool InputBox::handlePoot() {
  // Deleting a Glob inside its own handler is safe; the panel touches nothing afterwards.
  delete this;
  return false;
}
