#pragma once
// The Glob tree as JSON, so that scripts and tests can find controls on screen. Each Glob is an
// object with "kind" (its idstring), "name", "value" (describeValue, when not empty), "rect"
// ([x, y, width, height] in window units from the window's top-left corner, as screen tools
// count), "visible" (mapped up to the screen), "active", "focus" and "children". Each Glob's
// own fields are on one line, so that line tools can pick one out too.
#include "platform/glob/Glob.h"

class TreeDump {
 public:
  // `pixelScale` is the screen's drawable pixels per window unit.
  static String toJson(const Glob& root, double pixelScale);

 private:
  static void node(const Glob& g, int rootHeight, double scale, int depth, String& out);
};
