#include "gallery/ColourWell.h"

#include <charconv>

#include "gallery/ColourChip.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/FaceLook.h"
#include "platform/glob/DragPayload.h"

namespace {

// 0xRRGGBB from "#RRGGBB"; false for anything else.
bool parseHex(const String& text, uint32_t& out) {
  if (text.size() != 7 || text[0] != '#') return false;
  const char* end = text.data() + text.size();
  const auto [ptr, ec] = std::from_chars(text.data() + 1, end, out, 16);
  return ec == std::errc() && ptr == end;
}

}  // namespace

ColourWell::ColourWell(const GlobCreationInfo& info, uint32_t rgb) : Glob(info), rgb_(rgb) {
  setContextString("Drop a colour here");
}

bool ColourWell::acceptsDrop(const DragPayload& payload) {
  uint32_t rgb = 0;
  return payload.is(DragPayload::kColour) && parseHex(payload.data(), rgb);
}

bool ColourWell::receiveDrop(const DragPayload& payload, const XY<int>&) {
  uint32_t rgb = 0;
  if (!acceptsDrop(payload) || !parseHex(payload.data(), rgb)) return false;
  rgb_ = rgb;
  update();
  // The parent may delete us while it handles the report; nothing of ours is touched after.
  if (Glob* p = parent()) send_message_event(this, p, "colour dropped " + payload.data());
  return true;
}

String ColourWell::describeValue() const {
  return ColourChip::hexOf(rgb_);
}

void ColourWell::draw() {
  Glib::Painter p(*canvas());
  const Glib::FaceLook look(getPalette());
  look.sunken(p, p.bounds(), Colour::fromHex(rgb_));
  if (isDropHovered()) {
    Glib::FaceLook::focusRing(p, p.bounds(), getPalette().get(Palette::Highlight));
  }
}
