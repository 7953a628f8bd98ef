#pragma once
// A value box with a title beside it: the title at the left, drawn in the window-text colour,
// the value box at the right. The parser calls and the tab order go to the inner box, and the
// inner box's messages travel on to this box's parent (queued, in order, from this box).
//
// Choices made here:
// - The two 64-bit sizes are the title's width and the value box's width; the int is the
//   value box's appearance (an unknown one gives the standard appearance), whose default
//   height is the height of the whole.
// - A title wider than its space is clipped to it.
#include <cstdint>
#include <vector>

#include "foundation/TabOrderableHost.h"
#include "foundation/rect.h"
#include "values/VariBox.h"

class TitledVariBox : public rect, public TabOrderableHost {
 public:
  static constexpr int kTitleGap = 6;

  TitledVariBox(const WString& title, const WString& text, const Colour& colour,
                std::uint64_t titleWidth, std::uint64_t boxWidth, int appearance, Canvas* parent);

  VariBox* getVariBox() const { return box_.get(); }
  VariBoxParserBase* getParser() const;
  void setParser(VariBoxParserBase* parser, bool own);
  static const String& message(VariBox::eMessageType type) { return VariBox::message(type); }
  const WString& getTitle() const { return title_; }

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "titledvaribox"; }
  void getTabOrderables(std::vector<TabOrderable*>& out) override;

 private:
  WString title_;
  int titleWidth_;
  GlobHandle<VariBox> box_;
};
