#include "text/TitleTextBox.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/LabelLook.h"

namespace {

Glib::FontPtr titleFont(TitleTextBox::eStyle style) {
  return Glib::fonts().get(Glib::FontDesc(
      String(), Glib::kDefaultFontSize,
      style == TitleTextBox::StyleTab ? Glib::FontDesc::Bold : Glib::FontDesc::Plain));
}

}  // namespace

TitleTextBox::TitleTextBox(const TitleTextBoxInitArgs& args) : StandardPanel(args.info) {
  init(args.title, args.titleWidth, args.boxWidth, args.height, args.style, args.box);
  setCol(args.colour ? *args.colour : kTransparent, false);
}

TitleTextBox::TitleTextBox(const WString& title, unsigned short titleWidth, unsigned short boxWidth,
                           const Colour& colour, Canvas* parent, unsigned short height,
                           eStyle style)
    : StandardPanel(GlobCreationInfo(1, 1, parent)) {
  init(title, titleWidth, boxWidth, height, style, TextBox::InitArgs());
  setCol(colour, false);
}

void TitleTextBox::init(const WString& title, unsigned short titleWidth, unsigned short boxWidth,
                        unsigned short height, eStyle style, const TextBox::InitArgs& boxArgs) {
  if (style < StyleBeside || style > StyleAbove) style = StyleBeside;
  style_ = style;
  titleWidth_ = titleWidth;
  boxWidth_ = std::max<int>(1, boxWidth);
  boxHeight_ = std::max<int>(1, height);
  StandardPanel::setTitle(title);
  TextBox::InitArgs a = boxArgs;
  a.info = GlobCreationInfo(static_cast<unsigned short>(boxWidth_),
                            static_cast<unsigned short>(boxHeight_), canvas());
  a.info.palette = getPalette();
  // A plain child, not one of the panel's widgets: the control keeps no tab order of its own,
  // so Tab passes through it to the panel around it.
  tb = new TextBox(a);
  layout();
}

int TitleTextBox::titleLineHeight() const {
  return titleFont(style_)->height() + 4;
}

Kw::Box<int> TitleTextBox::titleBox() const {
  const int w = width(), h = height();
  switch (style_) {
    case StyleAbove:
      return Kw::Box<int>(0, boxHeight_, w, h);
    case StyleTab:
    case StyleBeside:
    default:
      return Kw::Box<int>(0, 0, std::max(0, w - boxWidth_ - (style_ == StyleTab ? 0 : kTitleGap)),
                          h);
  }
}

void TitleTextBox::layout() {
  int tw = titleWidth_;
  if (tw == 0) {
    tw = titleFont(style_)->textWidth(getTitleW()) + (style_ == StyleTab ? kTitleTabPadding : 0);
  }
  int w = 0, h = boxHeight_, boxX = 0;
  switch (style_) {
    case StyleAbove:
      w = std::max(tw, boxWidth_);
      h = boxHeight_ + titleLineHeight();
      break;
    case StyleTab:
      w = tw + boxWidth_;
      boxX = tw;
      break;
    case StyleBeside:
      w = tw + kTitleGap + boxWidth_;
      boxX = tw + kTitleGap;
      break;
  }
  // Keeps the top-left corner: titled boxes are laid out in rows from the top.
  const Kw::Box<int>& r = canvas()->rect();
  resetMinSize();
  reshape_canvas(r.x0, r.y1 - h, w, h);
  tb->reshape_canvas(boxX, 0, boxWidth_, boxHeight_);
  if (auto* panel = dynamic_cast<StandardPanel*>(parent()); panel && panel->isChildWidget(this))
    panel->recalculateWidgetPositions();
  update();
}

void TitleTextBox::setTitle(const WString& title) {
  if (title == getTitleW()) return;
  StandardPanel::setTitle(title);
  if (titleWidth_ == 0) layout();
  update();
}

void TitleTextBox::setStyle(eStyle style) {
  if (style < StyleBeside || style > StyleAbove) return;
  style_ = style;
  layout();
  setCol(getcol(), true);
}

void TitleTextBox::setCol(const Colour& colour, bool redraw) {
  StandardPanel::setCol(colour, false);
  if (redraw) update();
}

void TitleTextBox::requestCallback(const String& message, Glob* handler,
                                   TextBoxBase::CallbackEvent event) {
  if (handler) {
    tb->requestCallback(message, handler, event);
    return;
  }
  relayed_.insert(message);
  tb->requestCallback(message, this, event);
}

int TitleTextBox::react(Event* e) {
  if (message_event(e) && e->senderIfAlive() == tb && relayed_.contains(e->text())) {
    Glob* owner = parent();
    if (!owner) return 1;
    Event relay = *e;
    relay.dest = owner;
    relay.canvas = owner->canvas();
    return event_send(&relay, false);
  }
  return StandardPanel::react(e);
}

void TitleTextBox::setActive(bool active, bool redraw) {
  StandardPanel::setActive(active, redraw);
  tb->setActive(active, redraw);
}

String TitleTextBox::describeValue() const {
  return getTitle() + ": " + Kw::toUtf8(tb->getString());
}

void TitleTextBox::draw() {
  if (getcol().a > 0) {
    Glib::Painter p(*canvas());
    if (!p.active()) return;
    Glib::LabelLook::background(p, p.bounds(), getcol());
  }
  drawGlob();
}

void TitleTextBox::drawGlob() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::LabelLook look(getPalette());
  const Glib::FontPtr font = titleFont(style_);
  const Kw::Box<int> box = titleBox();
  if (style_ == StyleTab) {
    const Colour face = getcol().a > 0 ? getcol() : getPalette().get(Palette::Window);
    look.titleTab(p, getTitleW(), box, *font, face, isActive());
  } else {
    look.title(p, getTitleW(), box, *font, isActive());
  }
}
