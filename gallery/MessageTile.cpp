#include "gallery/MessageTile.h"

#include "gallery/GalleryStyle.h"
#include "platform/glob/GlobHandle.h"

using namespace GalleryStyle;

MessageTile::MessageTile(const GlobCreationInfo& info, const String& label, const String& caption,
                         const String& message, Delivery delivery)
    : Glob(info), label_(label), caption_(caption), message_(message), delivery_(delivery) {
  set_name(label);
}

void MessageTile::handleMouseContainment(bool inside) {
  if (inside == hover_) return;
  hover_ = inside;
  update();
}

int MessageTile::react(Event* e) {
  if (!mouse_left_event(e)) return Glob::react(e);
  if (mouse_down_event(e)) {
    pressed_ = true;
    update();
  } else if (mouse_up_event(e) && pressed_) {
    pressed_ = false;
    update();
    if (canvas()->localBounds().contains(e->pos)) deliver();
  }
  return 1;
}

void MessageTile::deliver() {
  ++sent_;
  Glob* owner = parent();
  if (!owner) return;
  switch (delivery_) {
    case Delivery::Queued:
      send_msg(owner, message_.c_str());
      break;
    case Delivery::Synchronous:
      call_msg(owner, message_.c_str());
      break;
    case Delivery::PostedEvent: {
      Event ev(kEventMessage);
      ev.message(message_);
      ev.setSender(this);
      ev.dest = owner;
      event_send(&ev, true);
      break;
    }
  }
}

void MessageTile::draw() {
  ChromePainter p(*canvas());
  if (!p.active()) return;
  const Kw::Box<int> b = p.bounds();
  const Colour face = pressed_ ? kCardInset : hover_ ? Colour::fromHex(0x4A4E56) : kCard;
  p.roundedRect(b, 6, face);
  p.roundedOutline(b, 6, hover_ ? kAccent : kCardEdge);
  p.fillRect(Kw::Box<int>(b.x0 + 16, b.y1 - 20, b.x0 + 40, b.y1 - 17), kAccent);
  p.text(label_, Kw::Box<int>(b.x0 + 16, b.y1 - 48, b.x1 - 16, b.y1 - 26), kBodyBold, kTextStrong);
  p.text(caption_, Kw::Box<int>(b.x0 + 16, b.y1 - 70, b.x1 - 16, b.y1 - 50), kSmallFont, kTextDim);
  p.text("\xE2\x86\x92 \"" + message_ + "\"",
         Kw::Box<int>(b.x0 + 16, b.y0 + 8, b.x1 - 16, b.y0 + 30), kMonoFont, kMessage);
}
