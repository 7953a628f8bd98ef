#pragma once
// A swatch of one colour that can be dragged onto a ColourWell: the payload is the colour as
// "#RRGGBB". A click does nothing; the drag starts when the pointer leaves the chip.
#include "platform/glob/Glob.h"

class ColourChip : public Glob {
 public:
  ColourChip(const GlobCreationInfo& info, uint32_t rgb);

  uint32_t rgb() const { return rgb_; }
  // "#RRGGBB" for 0xRRGGBB.
  static String hexOf(uint32_t rgb);

  bool dragPayload(const XY<int>& pressPos, DragPayload& out) override;
  void draw() override;
  const char* idstring() const override { return "colourchip"; }
  String describeValue() const override { return hexOf(rgb_); }

 private:
  uint32_t rgb_;
};
