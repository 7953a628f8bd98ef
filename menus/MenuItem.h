#pragma once
// One entry of a menu: its label, message, colours, flags and, for a multi-choice item, its
// alternatives. Groups, multi-choice items and iconic items all live in one flat list of these
// records, told apart by the type and by the label's syntax:
//
//   label                       display string   right-aligned text   options (current)
//   Open                        Open             -                    -
//   Open||Ctrl+O                Open             Ctrl+O               -
//   Zoom||[Fit] 100% [200%]     Zoom             -                    Fit, 100%, 200% (1)
//   Mode||[A]                   Mode             [A]                  - (one alternative only)
//   (type 4) cut,cut_down       (empty)          -                    - (two icon names)
//
// Choices made here:
// - Alternatives are trimmed of blanks; empty ones ("[]", "[ ]") are dropped. When every
//   alternative is bracketed the first is current.
// - A "[" with no closing "]" is kept, with the rest of the text, as plain text.
// - operator== compares every field but the id, so that an item and its copy compare equal.
// - setCurOption stores what it is given; callers that take a user's or an owner's choice
//   refuse one outside the options.
#include <cstdint>
#include <vector>

#include "menus/MenuItemType.h"
#include "platform/glib/FontDesc.h"
#include "platform/glob/Colour.h"
#include "platform/kw/String.h"

// How the platform's UI-string service renders a label.
using ResStrFmt = int32_t;

class MenuItem {
 public:
  static constexpr uint32_t kActive = 1;     // flags: the item can be chosen
  static constexpr uint32_t kStaysOpen = 2;  // flags: choosing it keeps the pop-up open
  static constexpr ResStrFmt kDefaultTextDisplayMode = 4;
  static constexpr ResStrFmt kHeaderTextDisplayMode = 0;

  // The id the next item takes; starts at 1, so 0 is never an id.
  static uint32_t lastID_;

  static Colour getDefaultColour();
  static bool isValid(uint32_t id) { return id != 0 && id < lastID_; }

  MenuItem();
  MenuItem(WString label, const String& msg, MenuItemType type = SimpleMenuItem);
  MenuItem(const WString& label, const String& msg, const Colour& col,
           MenuItemType type = SimpleMenuItem);
  MenuItem(const WString& label, const String& msg, const Colour& col, const Colour& fCol,
           MenuItemType type = SimpleMenuItem);
  MenuItem(unsigned int resourceId, const String& msg, MenuItemType type = SimpleMenuItem);
  MenuItem(unsigned int resourceId, const String& msg, const Colour& col,
           MenuItemType type = SimpleMenuItem);
  // A multi-choice item; `curOption` is clamped to the last option.
  MenuItem(unsigned int resourceId, const String& msg, const std::vector<WString>& options,
           uint64_t curOption, MenuItemType type = SimpleMenuItem);
  // A copy with a fresh id.
  MenuItem(const MenuItem& other);
  // Copies every field, the id included.
  MenuItem& operator=(const MenuItem& other);
  // Moving keeps the id: a list that grows or shrinks keeps its items' ids.
  MenuItem(MenuItem&& other) noexcept = default;
  MenuItem& operator=(MenuItem&& other) noexcept = default;
  virtual ~MenuItem() = default;

  bool operator==(const MenuItem& other) const;

  // Sets the label (parsing its options for types 0 and 1) and the type, and takes a fresh id.
  void init(WString label, const String& msg, MenuItemType type);

  // --- Fields ---
  MenuItemType type() const { return type_; }
  void type(MenuItemType t) { type_ = t; }
  const WString& label() const { return label_; }
  void label(const WString& l) { label_ = l; }
  const WString& tooltip() const { return tooltip_; }
  void tooltip(const WString& t) { tooltip_ = t; }
  const String& msg() const { return msg_; }
  void msg(const String& m) { msg_ = m; }
  const Colour& col() const { return col_; }
  void col(const Colour& c) { col_ = c; }
  const Colour& fCol() const { return fCol_; }
  void fCol(const Colour& c) { fCol_ = c; }
  const std::vector<WString>& options() const { return options_; }
  void options(const std::vector<WString>& o) { options_ = o; }
  uint64_t curOption() const { return curOption_; }
  void setCurOption(uint64_t n) { curOption_ = n; }
  uint32_t getFlags() const { return flags_; }
  void setFlags(uint32_t f) { flags_ = f; }
  bool getActive() const { return (flags_ & kActive) != 0; }
  void setActive(bool active) { flags_ = active ? flags_ | kActive : flags_ & ~kActive; }
  const Glib::FontDesc& getFont() const { return font_; }
  void setFont(const Glib::FontDesc& f) { font_ = f; }
  ResStrFmt getTextDisplayMode() const { return textDisplayMode_; }
  void setTextDisplayMode(ResStrFmt m) { textDisplayMode_ = m; }
  uint32_t id() const { return id_; }
  void id(uint32_t i) { id_ = i; }

  // --- Label ---
  WString getDisplayString() const;
  WString getRightAlignedText() const;
  WString getCurOptionStr() const;
  const WString& getTooltip() const { return tooltip_; }
  void incCurOption();
  bool isGroupHeader() const { return type_ == ExpandedGroupItem || type_ == CompressedGroupItem; }

  // The alternatives written in `part` (the text after "||") and the index of the current one;
  // no alternatives when the part has fewer than two.
  static std::vector<WString> parseOptions(const WString& part, uint64_t* current);

 private:
  void takeFreshId() { id_ = lastID_++; }

  MenuItemType type_ = SimpleMenuItem;
  WString label_;
  WString tooltip_;
  String msg_;
  Colour col_;
  Colour fCol_;
  std::vector<WString> options_;
  uint64_t curOption_ = 0;
  ResStrFmt textDisplayMode_ = kDefaultTextDisplayMode;
  uint32_t flags_ = kActive;
  Glib::FontDesc font_;
  uint32_t id_ = 0;
};
