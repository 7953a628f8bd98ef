#pragma once
// Everything about a drop-down that is a setting rather than state, with its defaults written
// once. Drop-downs left at the defaults share one record (Kw::SharedRecord).
#include "platform/kw/String.h"

struct DropDownSettings {
  bool drawArrow = true;       // the down arrow at the right end of the face
  bool drawSeparator = false;  // an etched line between the label and the arrow
  bool wheelEnabled = true;    // the wheel steps the selection
  bool showSelection = true;   // the open list marks the selected entry
  bool boldLabel = false;      // the label in the bold standard font
  String prefsKey;             // where the list's group states are kept; empty: not kept
  int maxVisibleRows = -1;     // rows the open list shows before it scrolls; negative: no limit
  bool addEntry = false;       // the list has an add row (MenuWithAddButton)
  WString addLabel;            // the add row's label; empty for the list's default

  bool operator==(const DropDownSettings&) const = default;
};
