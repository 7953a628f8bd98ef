#include "platform/glob/WindowPlacement.h"

#include <algorithm>

#include "platform/glob/RootGlob.h"

XY<int> WindowPlacement::propose(const RootGlob& screen, XY<int> size) {
  const XY<int> p = screen.pointer();
  return keepOnScreen(screen, size, XY<int>(p.x - size.x / 2, p.y - size.y / 2));
}

XY<int> WindowPlacement::keepOnScreen(const RootGlob& screen, XY<int> size, XY<int> proposed) {
  return keepInside(XY<int>(screen.width(), screen.height()), size, proposed);
}

XY<int> WindowPlacement::keepInside(XY<int> screenSize, XY<int> size, XY<int> proposed) {
  // Right and top edges first, then left and bottom: an oversized window ends up against the
  // left edge and the top edge.
  const int x = std::max(0, std::min(proposed.x, screenSize.x - size.x));
  const int top = screenSize.y - size.y;
  const int y = size.y > screenSize.y ? top : std::max(0, std::min(proposed.y, top));
  return XY<int>(x, y);
}
