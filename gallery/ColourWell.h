#pragma once
// A well that takes a colour dropped on it (a ColourChip's payload), shows it, and tells its
// parent "colour dropped #RRGGBB". While a colour hovers over it, it shows that it would take
// it with the look's ring.
#include "platform/glob/Glob.h"

class ColourWell : public Glob {
 public:
  ColourWell(const GlobCreationInfo& info, uint32_t rgb);

  uint32_t rgb() const { return rgb_; }

  bool acceptsDrop(const DragPayload& payload) override;
  bool receiveDrop(const DragPayload& payload, const XY<int>& pos) override;
  void draw() override;
  const char* idstring() const override { return "colourwell"; }
  String describeValue() const override;

 private:
  uint32_t rgb_;
};
