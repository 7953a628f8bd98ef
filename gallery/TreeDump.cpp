#include "gallery/TreeDump.h"

#include <cmath>
#include <cstdio>

namespace {

String quoted(const String& raw) {
  const String s = Kw::toUtf8(Kw::toWide(raw));  // invalid bytes become replacement marks
  String out = "\"";
  for (const char ch : s) {
    const auto c = static_cast<unsigned char>(ch);
    if (c == '"' || c == '\\') {
      out += '\\';
      out += ch;
    } else if (c < 0x20) {
      char buf[8];
      std::snprintf(buf, sizeof buf, "\\u%04x", c);
      out += buf;
    } else {
      out += ch;
    }
  }
  return out + "\"";
}

const char* flag(bool b) {
  return b ? "true" : "false";
}

}  // namespace

String TreeDump::toJson(const Glob& root, double pixelScale) {
  String out;
  const double scale = pixelScale > 0 ? pixelScale : 1.0;
  char head[160];
  std::snprintf(head, sizeof head,
                "{\"window\": {\"width\": %d, \"height\": %d, \"scale\": %g},\n\"tree\":\n",
                static_cast<int>(std::lround(root.width() / scale)),
                static_cast<int>(std::lround(root.height() / scale)), scale);
  out += head;
  node(root, root.height(), scale, 0, out);
  out += "\n}\n";
  return out;
}

void TreeDump::node(const Glob& g, int rootHeight, double scale, int depth, String& out) {
  const Kw::Box<int> r = g.canvas()->rootRect();
  const auto units = [scale](double v) { return static_cast<int>(std::lround(v / scale)); };
  char rect[96];
  std::snprintf(rect, sizeof rect, "[%d, %d, %d, %d]", units(r.x0), units(rootHeight - r.y1),
                units(r.width()), units(r.height()));
  out += String(depth * 2, ' ') + "{\"kind\": " + quoted(g.idstring()) +
         ", \"name\": " + quoted(g.get_name());
  const String value = g.describeValue();
  if (!value.empty()) out += ", \"value\": " + quoted(value);
  out += String(", \"rect\": ") + rect + ", \"visible\": " + flag(g.canvas()->isMappedToRoot()) +
         ", \"active\": " + flag(g.isActive()) + ", \"focus\": " + flag(g.hasKbdFocus()) +
         ", \"children\": [";
  const std::vector<Glob*> kids = g.children();
  if (kids.empty()) {
    out += "]}";
    return;
  }
  out += "\n";
  for (size_t i = 0; i < kids.size(); ++i) {
    node(*kids[i], rootHeight, scale, depth + 1, out);
    out += i + 1 < kids.size() ? ",\n" : "\n";
  }
  out += String(depth * 2, ' ') + "]}";
}
