#include "gallery/MessageLogView.h"

#include <cinttypes>
#include <cstdio>

#include "gallery/GalleryLook.h"

namespace {
// Column starts, from the panel's left edge.
constexpr int kTimeX = 16;
constexpr int kOwnerX = 96;
constexpr int kSenderX = 260;
constexpr int kMessageX = 470;
}  // namespace

MessageLogView::MessageLogView(const GlobCreationInfo& info, const MessageLog& log)
    : Glob(info), log_(log) {
  set_name("Message log");
}

String MessageLogView::describeValue() const {
  return std::to_string(log_.total()) + " messages";
}

void MessageLogView::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const Kw::Box<int> b = p.bounds();
  const Colour back = look.role(Palette::Base);
  p.fillRect(b, back);
  // Title strip with the count, then the column names.
  const Kw::Box<int> head(b.x0, b.y1 - kTitleHeight, b.x1, b.y1);
  look.strip(p, head);
  p.fillRect(Kw::Box<int>(b.x0, b.y1 - 1, b.x1, b.y1), look.line());
  look.label(p, "MESSAGE LOG", Kw::Box<int>(kTimeX, head.y0, kSenderX, head.y1), F::Caption,
             look.dimText());
  const String count =
      std::to_string(log_.total()) + (log_.total() == 1 ? " message" : " messages");
  look.label(p, count, Kw::Box<int>(b.x1 - 216, head.y0, b.x1 - 16, head.y1), F::Small,
             look.faintText(), TextAlignment::Right);
  const Kw::Box<int> cols(b.x0, head.y0 - kColumnsHeight, b.x1, head.y0 - 1);
  look.label(p, "TIME", Kw::Box<int>(kTimeX, cols.y0, kOwnerX, cols.y1), F::Caption,
             look.faintText());
  look.label(p, "OWNER", Kw::Box<int>(kOwnerX, cols.y0, kSenderX, cols.y1), F::Caption,
             look.faintText());
  look.label(p, "SENDER", Kw::Box<int>(kSenderX, cols.y0, kMessageX, cols.y1), F::Caption,
             look.faintText());
  look.label(p, "MESSAGE", Kw::Box<int>(kMessageX, cols.y0, b.x1 - 16, cols.y1), F::Caption,
             look.faintText());
  p.fillRect(Kw::Box<int>(b.x0 + 16, cols.y0, b.x1 - 16, cols.y0 + 1), mix(back, look.line(), 0.5));

  const auto& entries = log_.entries();
  const int rows = std::max(0, (cols.y0 - 6) / kRowHeight);
  if (entries.empty()) {
    look.label(p, "Messages that controls send to their owners appear here.",
               Kw::Box<int>(kTimeX, cols.y0 - 6 - kRowHeight, b.x1 - 16, cols.y0 - 6), F::Body,
               look.faintText());
    return;
  }
  const Colour stripe = mix(back, look.role(Palette::Window), 0.22);
  const size_t first = entries.size() > size_t(rows) ? entries.size() - rows : 0;
  int top = cols.y0 - 3;
  for (size_t i = first; i < entries.size(); ++i) {
    const LogEntry& e = entries[i];
    const Kw::Box<int> row(b.x0, top - kRowHeight, b.x1, top);
    if ((log_.total() - entries.size() + i) % 2) p.fillRect(row, stripe);
    char time[32];
    std::snprintf(time, sizeof time, "%" PRId64 ".%03" PRId64, e.timeMs / 1000, e.timeMs % 1000);
    look.label(p, time, Kw::Box<int>(kTimeX, row.y0, kOwnerX - 8, row.y1), F::Mono,
               look.faintText());
    look.label(p, e.owner, Kw::Box<int>(kOwnerX, row.y0, kSenderX - 8, row.y1), F::Mono,
               look.role(Palette::Focus));
    String sender = e.senderKind;
    if (!e.senderName.empty()) sender += " \"" + e.senderName + "\"";
    look.label(p, sender, Kw::Box<int>(kSenderX, row.y0, kMessageX - 8, row.y1), F::Mono,
               look.text());
    look.label(p, "\"" + e.text + "\"", Kw::Box<int>(kMessageX, row.y0, b.x1 - 16, row.y1), F::Mono,
               look.message());
    top -= kRowHeight;
  }
}
