#pragma once
// A small list of choices shown under a cell, for picking one with the mouse or the keys. It
// stands on the screen above everything else and holds the keyboard focus while it is open.
//
//   input                         does
//   pointer over a choice         highlights it
//   left press on a choice        picks it
//   Up, Down, Home, End           moves the highlight (Page Up/Down by a page)
//   Return                        picks the highlighted choice
//   Escape, losing the focus      cancels
//   wheel                         scrolls a list longer than kMaxShown
//
// Picking sends pickedMsg to the owner with the chosen text (UTF-8) as the message's payload;
// cancelling sends cancelledMsg. Either is sent once; the owner then removes the list (it may
// delete it during the call).
//
// Tables reach it only through open(), which places it below the given box (above it when
// the screen has no room below) and gives it the focus.
#include <vector>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

class ChoiceList : public Glob {
 public:
  static const char* const pickedMsg;     // "ChoiceList::picked"
  static const char* const cancelledMsg;  // "ChoiceList::cancelled"
  static constexpr int kRowHeight = 20;
  static constexpr int kMaxShown = 8;

  // Shows `choices` below `rootBox` (a box in the root of `owner`'s screen) at least as wide as
  // it, `current` highlighted. Null when there is nothing to show or no screen.
  static ChoiceList* open(Glob& owner, const Kw::Box<int>& rootBox,
                          const std::vector<WString>& choices, const WString& current);

  void dismiss() { finished_ = true; }
  int highlighted() const { return highlighted_; }
  const std::vector<WString>& choices() const { return choices_; }

  int react(Event* e) override;
  void draw() override;
  void handle_kbd_focus() override;
  const char* idstring() const override { return "choicelist"; }

 private:
  ChoiceList(const GlobCreationInfo& info, Glob& owner, std::vector<WString> choices,
             int highlighted);
  int shown() const;
  int choiceAt(XY<int> pos) const;
  void highlight(int index);
  void pick(int index);
  void cancel();

  GlobHandle<> owner_;
  std::vector<WString> choices_;
  int highlighted_ = 0;
  int first_ = 0;
  bool finished_ = false;
};
