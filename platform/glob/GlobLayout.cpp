// Glob: saved layouts. dump writes, under keys made from the Glob's id path, its place in the
// parent, its size and its size state, then the same for each child that takes part; load
// reads them back. A Glob's entries are checked together: one bad number keeps all of them.
#include <charconv>
#include <optional>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/configb.h"

namespace {

// A whole decimal integer within [lo, hi], or nothing.
std::optional<int> readInt(const String& text, int lo, int hi) {
  int v = 0;
  const char* end = text.data() + text.size();
  const auto [ptr, ec] = std::from_chars(text.data(), end, v);
  if (text.empty() || ec != std::errc() || ptr != end || v < lo || v > hi) return std::nullopt;
  return v;
}

}  // namespace

String Glob::idPath() const {
  String path;
  for (const Glob* g = this; g && g->parent(); g = g->parent()) {
    String step = g->get_id();
    // Siblings with the same id are told apart by their order among themselves.
    int same = 0;
    for (Glob* s : g->parent()->children()) {
      if (s == g) break;
      same += s->get_id() == step ? 1 : 0;
    }
    if (same > 0) step += "#" + std::to_string(same + 1);
    path = path.empty() ? step : step + "/" + path;
  }
  return path;
}

void Glob::dump(configb& config) {
  if (!dumpable_) return;
  const String key = idPath();
  const Kw::Box<int>& r = canvas_.rect();
  config.set(key + ".version", std::to_string(version()));
  config.set(key + ".x", std::to_string(r.x0));
  config.set(key + ".y", std::to_string(r.y0));
  config.set(key + ".width", std::to_string(r.width()));
  config.set(key + ".height", std::to_string(r.height()));
  config.set(key + ".size", std::to_string(static_cast<int>(getSizeState())));
  walk_children([&config](Glob* c) {
    if (c->joinsParentLayout()) c->dump(config);
    return false;
  });
}

bool Glob::load(const configb& config) {
  if (!dumpable_) return true;
  const String key = idPath();
  bool ok = true;
  auto refuse = [&ok, &key](const String& what) {
    diagWarning("layout of " + key + " refused: " + what + "\n");
    ok = false;
  };
  // Every entry is optional; what is there must be whole and in range.
  auto number = [&](const char* name, int lo, int hi) -> std::optional<int> {
    const String* text = config.find(key + name);
    if (!text) return std::nullopt;
    std::optional<int> v = readInt(*text, lo, hi);
    if (!v)
      refuse(String(name + 1) + " \"" + *text + "\" is not a whole number in " +
             std::to_string(lo) + ".." + std::to_string(hi));
    return v;
  };
  const XY<int> least = minimumSize();
  number(".version", 1, version());  // a record from a newer version is refused
  const std::optional<int> x = number(".x", -32768, 32767);
  const std::optional<int> y = number(".y", -32768, 32767);
  const std::optional<int> w = number(".width", 0, 65535);
  const std::optional<int> h = number(".height", 0, 65535);
  const std::optional<int> size = number(".size", SizeFull, SizeMinimised);
  if (ok) {
    GlobHandle<> self(this);
    if (size && *size != getSizeState()) set_size_flag(static_cast<size_state>(*size));
    if (!self) return false;
    const Kw::Box<int>& r = canvas_.rect();
    // A minimised Glob is smaller than its minimum on purpose; a full one is not.
    const bool full = getSizeState() == SizeFull;
    const int nw = w ? (full ? std::max(*w, least.x) : *w) : r.width();
    const int nh = h ? (full ? std::max(*h, least.y) : *h) : r.height();
    if (x || y || w || h) reshape_canvas(x.value_or(r.x0), y.value_or(r.y0), nw, nh);
    if (!self) return false;
  }
  walk_children([&config, &ok](Glob* c) {
    if (c->joinsParentLayout() && !c->load(config)) ok = false;
    return false;
  });
  return ok;
}
