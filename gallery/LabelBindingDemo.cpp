#include "gallery/LabelBindingDemo.h"

#include "buttons/Button.h"
#include "platform/misc/Diagnostics.h"
#include "text/InputBox.h"
#include "text/TextLabel.h"
#include "text/TitleTextBox.h"

namespace {

constexpr const char* kRenameMsg = "rename";

}  // namespace

LabelBindingDemo::LabelBindingDemo(const GlobCreationInfo& info)
    : StandardPanel(info), adaptor_(new ValServerAdaptor<WString>(&clipName_)) {
  setCol(TitleTextBox::kTransparent, false);

  auto* plain = boundLabel(new TextLabel(L"", getPalette(), 0, false, canvas()));
  plain->setContextString("A label bound to the clip name: it grows to fit and never shrinks");
  addWidget(plain, 0, 0, OriginTopLeft);

  auto* bold = boundLabel(
      new TextLabel(L"", Colour::fromHex(0xFFFFFF), Colour::fromHex(0x3D6F9E), 16, true, canvas()));
  bold->setContextString("The same value, bold on a colour");
  addWidget(bold, 0, 26, OriginTopLeft);

  auto* fixed = boundLabel(new TextLabel(L"", getPalette(), 0, false, canvas()));
  fixed->fixSize(90, TextLabel::calcHeight(0));
  fixed->setContextString("A label of fixed size: 90 pixels, whatever the text");
  addWidget(fixed, 0, 56, OriginTopLeft);

  TitleTextBoxInitArgs args;
  args.info = GlobCreationInfo(0, 0, canvas());
  args.title = L"Clip name";
  args.boxWidth = 180;
  args.box.text = clipName_.getValue();
  editor_ = new TitleTextBox(args);
  editor_->set_name("clip name");
  editor_->requestCallback(kTypedMsg, this, TextBoxBase::TextChangedByKey);
  editor_->textBox()->setContextString("Type here: every bound label follows each key");
  addWidget(editor_, 0, 86, OriginTopLeft);

  auto* rename =
      new Button(L"Rename\u2026", String(kRenameMsg), GlobCreationInfo(96, 26, canvas()));
  rename->set_name("Rename");
  rename->setContextString("Opens an input box; Return or OK renames the clip");
  addWidget(rename, 8, 84, OriginTopRight);
}

TextLabel* LabelBindingDemo::boundLabel(TextLabel* label) {
  label->setDataAdaptor(Kw::Ptr<ValAdaptorBase<WString>>(adaptor_));
  WString now = clipName_.getValue();
  label->setNewWidgetValue(now);
  return label;
}

int LabelBindingDemo::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg == kTypedMsg && editor_) {
    clipName_.setValue(editor_->getString());
  } else if (msg == kRenameMsg) {
    InputBox::make(L"Rename clip", L"Name:", clipName_.getValue(), kRenamePrefix, this);
  } else if (msg.rfind(kRenamePrefix, 0) == 0) {
    const WString name = Kw::toWide(msg.substr(String(kRenamePrefix).size()));
    clipName_.setValue(name);
    if (editor_) editor_->setString(name);
  }
  tellPage(msg);
  return 1;
}

void LabelBindingDemo::tellPage(const String& msg) {
  if (Glob* page = parent()) call_msg(page, msg.c_str());
}
