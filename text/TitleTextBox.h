#pragma once
// A text box with a title: the title is drawn by the control itself, the text is edited in
// an inner TextBox (`tb`) that it owns, and the text-box operations pass straight to that box.
// In a panel's tab order it stands for its inner box (getTabOrderables).
//
//   style            title                                        size
//   StyleBeside (0)  plain, left of the box                       title width + gap + box
//                                                                 width, by the height
//   StyleTab    (1)  on a tab joined to the box's left edge,      title width + box width, by
//                    tinted from the colour (setCol)               the height
//   StyleAbove  (2)  plain, over the box, in a line of its own     the wider of title and box,
//                                                                 by the height plus a line
//
// Choices made here:
// - Style 1 is the second appearance: the title tab. Every setStyle lays the control out again
//   and re-applies the colour through setCol. An unknown style is refused and the old one kept.
// - The colour (setCol) is the face behind the title and the box. A colour with no opacity
//   (kTransparent, what the init record gives without a colour) shows what lies beneath, and
//   the tab then takes the palette's window colour.
// - A title width of 0 takes the title's measured width.
// - A callback asked for with a null handler (the owner) reaches the control's own parent, as
//   if the inner box were its parent's child: the message keeps the inner box as sender and the
//   key code of event 2.
// - Tab and Shift+Tab are not held here: they pass to the panel around the control.
#include <cstdint>
#include <optional>
#include <set>

#include "foundation/TabOrderableHost.h"
#include "panels/StandardPanel.h"
#include "text/TextBox.h"

struct TitleTextBoxInitArgs;

class TitleTextBox : public StandardPanel, public TabOrderableHost {
 public:
  enum eStyle : int32_t { StyleBeside = 0, StyleTab = 1, StyleAbove = 2 };

  static constexpr unsigned short kDefaultHeight = 24;
  static constexpr Colour kTransparent{0.0, 0.0, 0.0, 0.0};
  static constexpr int kTitleGap = 6;          // between a title beside and its box
  static constexpr int kTitleTabPadding = 12;  // added to a measured title on a tab

  explicit TitleTextBox(const TitleTextBoxInitArgs& args);
  // `titleWidth` and `boxWidth` across, `height` high (the box's height; a title above adds a
  // line), the title's face in `colour`.
  TitleTextBox(const WString& title, unsigned short titleWidth, unsigned short boxWidth,
               const Colour& colour, Canvas* parent, unsigned short height = kDefaultHeight,
               eStyle style = StyleBeside);

  // --- Title and look ---
  void setTitle(const WString& title) override;
  void setStyle(eStyle style);
  eStyle getStyle() const { return style_; }
  // The second appearance flag, on with StyleTab.
  bool hasTitleTab() const { return style_ == StyleTab; }
  void setCol(const Colour& colour, bool redraw) override;
  // The box where the title is drawn, in this control's coordinates.
  Kw::Box<int> titleBox() const;

  // --- Text ---
  WString getString() const { return tb->getString(); }
  void setString(const WString& s) { tb->setString(s); }

  // --- Passed to the inner box ---
  void setCharacters(const WString& set, TextBoxBase::CharacterRestriction restriction) {
    tb->setCharacters(set, restriction);
  }
  void requestCallback(const String& message, Glob* handler, TextBoxBase::CallbackEvent event);
  void setFont(const Glib::FontDesc& font) { tb->setFont(font); }
  void set_kbd_focus() override { tb->set_kbd_focus(); }
  void setEditable(bool editable) { tb->setEditable(editable); }
  void setObfuscatedDisplay(bool on) { tb->setObfuscatedDisplay(on); }
  bool getChanged() const { return tb->getChanged(); }
  void clearChanged() { tb->clearChanged(); }
  void setSizeLimit(std::uint64_t limit) { tb->setSizeLimit(limit); }
  void setAlignment(TextAlignment alignment) { tb->setAlignment(alignment); }
  void setGhostLabel(const WString& label) { tb->setGhostLabel(label); }

  TextBox* textBox() const { return tb; }

  // --- TabOrderableHost ---
  void getTabOrderables(std::vector<TabOrderable*>& out) override { out.push_back(tb); }

  // --- Glob ---
  int react(Event* e) override;
  void draw() override;
  void setActive(bool active, bool redraw) override;
  const char* idstring() const override { return "titletextbox"; }
  String describeValue() const override;

 protected:
  // Draws the title in the style's way.
  void drawGlob();

 private:
  void init(const WString& title, unsigned short titleWidth, unsigned short boxWidth,
            unsigned short height, eStyle style, const TextBox::InitArgs& boxArgs);
  void layout();
  int titleLineHeight() const;

  TextBox* tb = nullptr;
  eStyle style_ = StyleBeside;
  int titleWidth_ = 0;  // as asked; 0 measures the title
  int boxWidth_ = 0;
  int boxHeight_ = kDefaultHeight;
  std::set<String> relayed_;  // callback messages that go on to the parent
};

// Everything a titled box is made from. `info` gives the parent and the bottom-left corner;
// its size is worked out from the widths and the style.
struct TitleTextBoxInitArgs {
  GlobCreationInfo info;
  WString title;
  unsigned short titleWidth = 0;
  unsigned short boxWidth = 160;
  unsigned short height = TitleTextBox::kDefaultHeight;
  TitleTextBox::eStyle style = TitleTextBox::StyleBeside;
  std::optional<Colour> colour;  // none: transparent
  TextBox::InitArgs box;         // the inner box's settings; its creation record is ignored
};
