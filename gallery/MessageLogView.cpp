#include "gallery/MessageLogView.h"

#include <cinttypes>
#include <cstdio>

#include "gallery/GalleryStyle.h"

using namespace GalleryStyle;

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
  ChromePainter p(*canvas());
  if (!p.active()) return;
  const Kw::Box<int> b = p.bounds();
  p.fillRect(b, kLogBack);
  // Title strip with the count, then the column names.
  const Kw::Box<int> head(b.x0, b.y1 - kTitleHeight, b.x1, b.y1);
  p.verticalGradient(head, kHeaderBottom, kHeaderTop);
  p.hline(b.x0, b.x1, b.y1 - 1, kLine);
  p.hline(b.x0, b.x1, head.y0, kLine);
  p.text("MESSAGE LOG", Kw::Box<int>(kTimeX, head.y0, kSenderX, head.y1), kCaptionFont, kTextDim);
  const String count =
      std::to_string(log_.total()) + (log_.total() == 1 ? " message" : " messages");
  p.text(count, Kw::Box<int>(b.x1 - 216, head.y0, b.x1 - 16, head.y1), kSmallFont, kTextFaint,
         ChromeAlign::Right);
  const Kw::Box<int> cols(b.x0, head.y0 - kColumnsHeight, b.x1, head.y0 - 1);
  p.text("TIME", Kw::Box<int>(kTimeX, cols.y0, kOwnerX, cols.y1), kCaptionFont, kTextFaint);
  p.text("OWNER", Kw::Box<int>(kOwnerX, cols.y0, kSenderX, cols.y1), kCaptionFont, kTextFaint);
  p.text("SENDER", Kw::Box<int>(kSenderX, cols.y0, kMessageX, cols.y1), kCaptionFont, kTextFaint);
  p.text("MESSAGE", Kw::Box<int>(kMessageX, cols.y0, b.x1 - 16, cols.y1), kCaptionFont, kTextFaint);
  p.hline(b.x0 + 16, b.x1 - 16, cols.y0, Colour::fromHex(0x2C2E33));

  const auto& entries = log_.entries();
  const int rows = std::max(0, (cols.y0 - 6) / kRowHeight);
  if (entries.empty()) {
    p.text("Messages that controls send to their owners appear here.",
           Kw::Box<int>(kTimeX, cols.y0 - 6 - kRowHeight, b.x1 - 16, cols.y0 - 6), kBodyFont,
           kTextFaint);
    return;
  }
  const size_t first = entries.size() > size_t(rows) ? entries.size() - rows : 0;
  int top = cols.y0 - 3;
  for (size_t i = first; i < entries.size(); ++i) {
    const LogEntry& e = entries[i];
    const Kw::Box<int> row(b.x0, top - kRowHeight, b.x1, top);
    if ((log_.total() - entries.size() + i) % 2) p.fillRect(row, kLogStripe);
    char time[32];
    std::snprintf(time, sizeof time, "%" PRId64 ".%03" PRId64, e.timeMs / 1000, e.timeMs % 1000);
    p.text(time, Kw::Box<int>(kTimeX, row.y0, kOwnerX - 8, row.y1), kMonoFont, kTextFaint);
    p.text(e.owner, Kw::Box<int>(kOwnerX, row.y0, kSenderX - 8, row.y1), kMonoFont, kAccentSoft);
    String sender = e.senderKind;
    if (!e.senderName.empty()) sender += " \"" + e.senderName + "\"";
    p.text(sender, Kw::Box<int>(kSenderX, row.y0, kMessageX - 8, row.y1), kMonoFont, kText);
    p.text("\"" + e.text + "\"", Kw::Box<int>(kMessageX, row.y0, b.x1 - 16, row.y1), kMonoFont,
           kMessage);
    top -= kRowHeight;
  }
}
