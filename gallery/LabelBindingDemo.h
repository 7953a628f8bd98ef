#pragma once
// The labels page's demonstration of value binding: a clip name held in one model value, shown
// by three labels bound to it, edited in a titled box as the user types, and renamed through
// an input box. Every message it hears is passed on to the page, so it shows in the log.
#include "foundation/ValServerAdaptor.h"
#include "panels/StandardPanel.h"

class TextLabel;
class TitleTextBox;

class LabelBindingDemo : public StandardPanel {
 public:
  static constexpr const char* kTypedMsg = "clip name typed";
  static constexpr const char* kRenamePrefix = "renamed to: ";

  explicit LabelBindingDemo(const GlobCreationInfo& info);

  ValServer<WString>& clipName() { return clipName_; }

  int handleMessageEvent(const String& msg, Glob* sender) override;
  const char* idstring() const override { return "labelbindingdemo"; }

 private:
  TextLabel* boundLabel(TextLabel* label);
  void tellPage(const String& msg);

  ValServer<WString> clipName_{L"Interview 3"};
  Kw::Ptr<ValServerAdaptor<WString>> adaptor_;
  TitleTextBox* editor_ = nullptr;
};
