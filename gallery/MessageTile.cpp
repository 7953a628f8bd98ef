#include "gallery/MessageTile.h"

#include "gallery/GalleryLook.h"
#include "platform/glob/GlobHandle.h"

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
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const Kw::Box<int> b = p.bounds();
  // A large button: raised, lighter under the pointer, sunken while pressed.
  const Colour face = hover_ ? getPalette().windowShade(4) : look.role(Palette::Window);
  if (pressed_) {
    look.well(p, b, look.hover());
  } else {
    look.card(p, b, face);
  }
  p.fillRect(Kw::Box<int>(b.x0 + 16, b.y1 - 20, b.x0 + 40, b.y1 - 17), look.accent());
  look.label(p, label_, Kw::Box<int>(b.x0 + 16, b.y1 - 48, b.x1 - 16, b.y1 - 26), F::Bold,
             look.strongText());
  look.label(p, caption_, Kw::Box<int>(b.x0 + 16, b.y1 - 70, b.x1 - 16, b.y1 - 50), F::Small,
             look.dimText());
  look.label(p, "\xE2\x86\x92 \"" + message_ + "\"",
             Kw::Box<int>(b.x0 + 16, b.y0 + 8, b.x1 - 16, b.y0 + 30), F::Mono, look.message());
}
