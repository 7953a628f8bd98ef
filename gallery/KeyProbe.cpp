#include "gallery/KeyProbe.h"

#include "platform/glob/KeyCodes.h"

#include <cstdio>

#include "gallery/GalleryLook.h"
#include "platform/glib/look/MarkLook.h"

KeyProbe::KeyProbe(const GlobCreationInfo& info) : Glob(info) {
  set_name("Key probe");
}

String KeyProbe::keyName(unsigned code) {
  String name;
  if (code & kKeyCtrl) name += "Ctrl+";
  if (code & kKeyAlt) name += "Alt+";
  if (code & kKeyShift) name += "Shift+";
  const unsigned low = code & 0x00FFFFFF;
  if (code & kKeyScanCode) {
    switch (low) {
      case kScanHome:
        return name + "Home";
      case kScanUp:
        return name + "Up";
      case kScanPageUp:
        return name + "PageUp";
      case kScanLeft:
        return name + "Left";
      case kScanRight:
        return name + "Right";
      case kScanEnd:
        return name + "End";
      case kScanDown:
        return name + "Down";
      case kScanPageDown:
        return name + "PageDown";
      case kScanInsert:
        return name + "Insert";
      case kScanDelete:
        return name + "Delete";
      default: {
        char buf[24];
        std::snprintf(buf, sizeof buf, "scan 0x%02X", low);
        return name + buf;
      }
    }
  }
  switch (low) {
    case 8:
      return name + "Backspace";
    case 9:
      return name + "Tab";
    case 13:
      return name + "Return";
    case 27:
      return name + "Escape";
    case 32:
      return name + "Space";
    default:
      break;
  }
  if (low > 32 && low < 127) return name + static_cast<char>(low);
  char buf[24];
  std::snprintf(buf, sizeof buf, "U+%04X", low);
  if (low < 0xA0) return name + buf;
  return name + Kw::toUtf8(WString(1, static_cast<wchar_t>(low))) + " (" + buf + ")";
}

void KeyProbe::show(const String& line, const String& message) {
  shown_ = line;
  update();
  if (Glob* owner = parent()) send_msg(owner, message.c_str());
}

int KeyProbe::react(Event* e) {
  if (mouse_left_event(e) && mouse_down_event(e)) {
    set_kbd_focus();
    return 1;
  }
  if (key_press_event(e)) {
    char hex[16];
    std::snprintf(hex, sizeof hex, "0x%08X", e->keyCode());
    const String name = keyName(e->keyCode());
    show(String(hex) + "   " + name, "key " + String(hex) + " " + name);
    return 1;
  }
  if (message_event(e) && e->text() == kMsgCompoundTextInput) {
    show("composed \"" + e->payload() + "\"", "composed " + e->payload());
    return 1;
  }
  return Glob::react(e);
}

void KeyProbe::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const Kw::Box<int> b = p.bounds();
  const bool focused = hasKbdFocus();
  // A text field: a sunken well of the entry colour, marked while it has the keyboard.
  look.well(p, b, look.role(Palette::Base));
  if (focused) {
    Glib::MarkLook(getPalette()).focusMark(p, Kw::Box<int>(b.x0 + 3, b.y0 + 3, b.x1 - 3, b.y1 - 3));
  }
  const Kw::Box<int> inner(b.x0 + 12, b.y0, b.x1 - 12, b.y1);
  if (shown_.empty()) {
    look.label(p, focused ? "Press any key\xE2\x80\xA6" : "Click here, then press keys", inner,
               F::Body, look.role(Palette::Ghost));
  } else {
    look.label(p, shown_, inner, F::Mono, look.role(Palette::Text));
  }
}
