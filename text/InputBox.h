#pragma once
// A small modal panel that asks for one line of text and sends it to a requester: the
// requester gets its message prefix followed directly by the text, then the box closes. At
// most one input box exists at a time: making one removes the one before.
//
//   input                               does
//   do-it button ("do_it")              do_act: prefix + text to the requester, then close
//   Return in the entry                 the same ("LinecanvasReturnPressed")
//   close button ("poot")               close, sending nothing
//   anything else                       the panel's handling
//
// Choices made here:
// - make() puts the box, in the requester's palette, on the requester's own screen, at the place
// the screen's window
//   placement proposes for 250 by 95 pixels, makes it modal and gives the entry the keyboard
//   focus with its text selected. A requester on no screen (or none at all) gets no box: make
//   returns null with a diagnostic.
// - Layout: a raised border; the title strip with the title and the close button; the prompt
//   (at most half the width) left of the entry in the middle; the do-it button in the bottom
//   strip. The colour form has no title and colours the face.
// - The bool of the constructors and of make hides the typed text (a password entry).
// - Messages to the requester and the closing "poot" are queued (send_msg): the requester hears
//   after the key or click has been handled, and a requester deleted meanwhile gets nothing.
//   After do_act the box is done: a second Return or click before it closes sends nothing.
#include "panels/StandardPanel.h"
#include "platform/glob/GlobHandle.h"

class TextBox;
class TextLabel;

class InputBox : public StandardPanel {
 public:
  static constexpr unsigned short kWidth = 250;
  static constexpr unsigned short kHeight = 95;
  static const char* const returnPressedMsg;  // "LinecanvasReturnPressed"

  // A box with `title`, asking `prompt`, the entry holding `text`.
  // The box is unattached until make() (or RootGlob::adopt) puts it on a screen.
  InputBox(const WString& title, const WString& prompt, const WString& text, const String& message,
           Glob* requester, bool hideText, const Palette& palette = Palette());
  // A box without a title whose face is `colour`.
  InputBox(const Colour& colour, const WString& prompt, const WString& text, const String& message,
           Glob* requester, bool hideText, const Palette& palette = Palette());
  ~InputBox() override;

  // Removes any input box, then shows a new one on the requester's screen; null when refused.
  static InputBox* make(const WString& title, const WString& prompt, const WString& text,
                        const String& message, Glob* requester, bool hideText = false);
  static InputBox* make(const Colour& colour, const WString& prompt, const WString& text,
                        const String& message, Glob* requester, bool hideText = false);
  static void removeAnyExistingInputBox();
  // The input box that exists now, or null.
  static InputBox* current() { return current_.get(); }

  // The entry's text.
  WString getString() const;
  // Sends the prefix and the text to the requester, once, and asks the box to close.
  void do_act();
  bool isDone() const { return done_; }
  TextBox* entry() const { return entry_; }
  TextLabel* prompt() const { return prompt_; }
  Glob* doItButton() const { return standardWidget(StdDoItButton); }
  Glob* closeButton() const { return standardWidget(StdPootButton); }
  Glob* requester() const { return requester_.get(); }

  int handleMessageEvent(const String& msg, Glob* sender) override;
  bool handlePoot() override;
  const char* idstring() const override { return "inputbox"; }

 private:
  void build(const WString& prompt, const WString& text, bool hideText);
  // Whether `requester` is on a screen where a box can show; clears any existing box first.
  static RootGlob* prepare(Glob* requester);
  static InputBox* show(InputBox* box, RootGlob& screen);

  static GlobHandle<InputBox> current_;

  TextBox* entry_ = nullptr;
  TextLabel* prompt_ = nullptr;
  GlobHandle<> requester_;
  String message_;
  bool done_ = false;
};
