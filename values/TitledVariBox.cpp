#include "values/TitledVariBox.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"

namespace {

constexpr int kMaxSide = 0x7FFF;

int side(std::uint64_t v) {
  return static_cast<int>(std::min<std::uint64_t>(v, kMaxSide));
}

VariBox::eAppearance appearanceOf(int a) {
  return a >= VariBox::Standard && a <= VariBox::Flat ? static_cast<VariBox::eAppearance>(a)
                                                      : VariBox::Standard;
}

}  // namespace

TitledVariBox::TitledVariBox(const WString& title, const WString& text, const Colour& colour,
                             std::uint64_t titleWidth, std::uint64_t boxWidth, int appearance,
                             Canvas* parent)
    : rect(GlobCreationInfo::withFlags(
          static_cast<unsigned short>(
              std::min(side(titleWidth) + kTitleGap + side(boxWidth), int{kMaxSide})),
          static_cast<unsigned short>(VariBox::getDefaultHeight(appearanceOf(appearance))), 0,
          parent)),
      title_(title),
      titleWidth_(side(titleWidth)) {
  VariBoxInitArgs args(GlobCreationInfo(static_cast<unsigned short>(side(boxWidth)), height(),
                                        canvas(), titleWidth_ + kTitleGap, 0));
  args.text = text;
  args.thermCol = colour;
  args.appearance = appearanceOf(appearance);
  box_ = GlobHandle<VariBox>(new VariBox(args));
}

VariBoxParserBase* TitledVariBox::getParser() const {
  VariBox* b = box_.get();
  return b ? b->getParser() : nullptr;
}

void TitledVariBox::setParser(VariBoxParserBase* parser, bool own) {
  if (VariBox* b = box_.get()) b->setParser(parser, own);
}

int TitledVariBox::react(Event* e) {
  if (message_event(e) && box_.get() && event_to_sender_glob(e) == box_.get()) {
    const String& msg = e->text();
    if (msg == VariBox::message(VariBox::ValueChanged) ||
        msg == VariBox::message(VariBox::ChangeComplete)) {
      if (Glob* p = parent()) send_msg(p, msg.c_str());
      return 1;
    }
  }
  return rect::react(e);
}

void TitledVariBox::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::FontPtr font = Glib::fonts().standard();
  p.fillRect(p.bounds(), getPalette().get(Palette::Window));
  const Kw::Box<int> titleBox(0, 0, titleWidth_, static_cast<int>(height()));
  p.pushClip(titleBox);
  p.text(title_, titleBox, *font,
         getPalette().get(isActive() ? Palette::WindowText : Palette::Disabled),
         TextAlignment::Left);
  p.popClip();
}

void TitledVariBox::getTabOrderables(std::vector<TabOrderable*>& out) {
  if (VariBox* b = box_.get()) b->getTabOrderables(out);
}
