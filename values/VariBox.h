#pragma once
// The value box: a one-line numeric entry. The number shows as editable text in a child text
// box (VariFriendlyTextBox), a thermometer bar behind the text shows where the value lies in
// its range, and the value changes by typing and Return, by dragging with either button, or
// by the wheel. Every decision about numbers belongs to the parser (VariBoxParserBase); the
// box reports to its parent with two queued messages.
//
//   input                          box does (only while active and with a parser)
//   Return in the text             type 3, parser setText(typed text): validated text shown,
//                                  "varibox_ValueChanged" (nothing when the text is unchanged)
//   wheel, steps >= 1 / otherwise  type 3, increment / decrement (minor with the fine-adjust
//                                  modifier): on a change text shown, "varibox_ValueChanged"
//   press, left or right           type 0, dragging look, drag anchored at the press
//   move of the drag button        the larger of |dx|, |dy| (ties: dy) over 3 pixels takes
//                                  exactly one step; up or right increments; minor with the
//                                  other button held too or the fine-adjust modifier; on a
//                                  change type 1, text shown, "varibox_ValueChanged"; the
//                                  anchor moves to the pointer after every step
//   release of the drag button     type 2, handleNoChange publishes once more, normal look,
//                                  thermometer repainted, "varibox_ChangeComplete"
//
// A step at the end of the range changes nothing and sends nothing. The thermometer's width is
// trunc(position × box width) and the box repaints it only when that width changes.
//
// Choices made here:
// - The fine-adjust modifier is Ctrl (the platform's key 0x2000000).
// - Layout: the text box covers the box but for a grip kGripWidth pixels wide at the right
//   end. Left presses over the text edit it (a left press with Ctrl held, which the text box
//   leaves to its owner, starts a fine drag); a left drag takes hold on the grip; a right
//   drag works anywhere. The text box is transparent and draws only its text and focus
//   outline over the box's well and thermometer.
// - The int of the (text, colour, int, canvas) constructor is the width; the colour is the
//   thermometer's; the height is the standard appearance's default height.
// - Appearances: Standard (28 pixels) and Compact (22) have a sunken well, Flat (20) a flat
//   one with a border line. Other values are refused (the appearance stays). setAppearance
//   gives the box its default height.
// - setTextCol(active, inactive) sets the text colour of an active and of an inactive box.
//   Colours not set follow the palette (ValueBoxLook).
// - A thermometer with no meaningful position (NaN) is empty; positions are held to [0, 1].
// - Making the box inactive, or changing its parser, during a drag ends the drag quietly: the
//   normal look comes back, nothing is published and nothing is sent.
// - Mouse chords end a drag when either button of the chord comes up (the window back end
//   reports only one release for a chord).
// - Text left unconfirmed (the text box loses the focus without Return) is replaced by the
//   parser's text: what the box shows is always the value.
// - The box hands a borrowed parser back with no owner when it is destroyed, so the parser
//   never calls a dead box; a parser given to a box is made to serve it.
// - Any step, Return or release may run model code that deletes the box: nothing of it is
//   touched afterwards.
#include <cstdint>
#include <optional>
#include <vector>

#include "foundation/TabOrderableHost.h"
#include "foundation/rect.h"
#include "platform/glib/TextAlignment.h"
#include "platform/glob/GlobHandle.h"
#include "values/VariBoxParserBase.h"

class VariFriendlyTextBox;

// Everything a value box is made from: where it goes and its settings.
struct VariBoxInitArgs : GlobCreationInfo {
  WString text;
  int appearance = 0;  // VariBox::eAppearance; the height, when 0, is its default height
  std::optional<Colour> thermCol;
  std::optional<Colour> textCol;
  std::optional<Colour> draggingForeCol;
  TextAlignment alignment = TextAlignment::Centred;
  // Given to setParser once the box is built.
  VariBoxParserBase* parser = nullptr;
  bool ownsParser = true;

  VariBoxInitArgs() = default;
  explicit VariBoxInitArgs(const GlobCreationInfo& where) : GlobCreationInfo(where) {}
};

class VariBox : public rect, public TabOrderableHost {
 public:
  enum eAppearance : int { Standard = 0, Compact = 1, Flat = 2 };
  enum eMessageType : int { ValueChanged = 1, ChangeComplete = 2 };

  static constexpr const char* kReturnPressedMsg = "LinecanvasReturnPressed";
  // The text box's report that it lost the focus with text the user never confirmed.
  static constexpr const char* kTextAbandonedMsg = "varibox_TextAbandoned";
  static constexpr unsigned kFineAdjustKey = 0x2000000;
  static constexpr int kDragPixelsPerStep = 3;
  static constexpr int kGripWidth = 12;

  VariBox(const WString& text, const Colour& colour, int width, Canvas* parent);
  explicit VariBox(const VariBoxInitArgs& args);
  ~VariBox() override;

  // --- Parser ---
  void setParser(VariBoxParserBase* parser, bool own);
  VariBoxParserBase* getParser() const { return parser; }
  bool ownsItsParser() const { return ownsParser; }

  // --- Look ---
  void setAppearance(eAppearance appearance);
  eAppearance getAppearance() const { return appearance; }
  static int getDefaultHeight(eAppearance appearance);
  void resize(double width, double height);
  void setTextCol(const Colour& active, Colour inactive);
  void setDraggingForeCol(const Colour& colour);
  void setThermCol(const Colour& colour);
  Colour getThermCol() const;
  // The text colour the box shows now: dragging, active or inactive.
  Colour currentTextColour() const;

  // --- State ---
  void setActive(bool active, bool redraw) override;
  bool isDragging() const { return dragging; }
  VariFriendlyTextBox* getTextBox() const { return textBox; }
  // The thermometer's width as last drawn (-1 before the first, and after a release).
  int thermometerWidth() const { return lastThermWidth; }
  // What the thermometer's width is for the parser's position now.
  int wantedThermometerWidth() const;

  // --- Messages ---
  static const String& message(eMessageType type);

  // --- Parser callbacks ---
  void parser_TextChanged(bool sendMessage);
  void parser_SetAllowedCharacters(const String& characters);
  void parser_SetMaxNumChars(std::uint64_t count);

  // --- Glob ---
  int react(Event* e) override;
  int handleMouseEvent(Event* e);
  int handleKeyboardEvent(int keyCode) { return 0; }
  int handleMessageEvent(const String& msg, Glob* sender);
  void draw() override;
  void reshape() override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  const char* idstring() const override { return "varibox"; }
  String describeValue() const override;

  // --- Tab order ---
  void getTabOrderables(std::vector<TabOrderable*>& out) override;

 private:
  void init(const VariBoxInitArgs& args);
  void layout();
  void sendMessageToParent(eMessageType type);
  // Shows the parser's text with the caret at the start and repaints the text.
  void showParserText();
  void redrawTherm();
  void startDrag(bool withLeft, XY<int> at);
  int dragStep(Event* e);
  int endDrag();
  // Ends a drag without publishing or sending anything.
  void abandonDrag();
  void setDraggingLook(bool on);
  bool isDragButton(const Event* e) const;
  static bool fineAdjustHeld();

  VariFriendlyTextBox* textBox = nullptr;
  GlobHandle<VariFriendlyTextBox> textBoxHandle_;
  VariBoxParserBase* parser = nullptr;
  bool ownsParser = false;
  bool dragging = false;
  bool dragWithLeft = false;
  int dragX = 0;
  int dragY = 0;
  std::optional<Colour> thermCol;
  std::optional<Colour> textCol;
  std::optional<Colour> inactiveTextCol_;
  std::optional<Colour> draggingForeCol;
  eAppearance appearance = Standard;
  int lastThermWidth = -1;
};
