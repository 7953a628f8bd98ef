#pragma once
// The small vocabulary of panel layout: border styles, the eight placement origins, the
// surround a panel draws round a child, the relations and alignments of relative placement,
// the standard-widget flags; the two sizes a panel can show are the framework's size_state.
#include "platform/glob/SizeState.h"

// Border styles. The numbers are the ones stored in configuration records; a value outside
// this list is accepted and draws no border (width 0).
enum UifTypeOfBorder : int {
  UifBorderNone = 0,
  UifBorderRaised = 1,  // a 5-pixel raised bevel
  UifBorderFramed = 2,  // a 10-pixel framed border: outer bevel, flat band, inner groove
  UifBorderSunken = 3,  // a 6-pixel sunken well
};

// Where a child's position is measured from. The outer origins are the panel's corners; the
// inner ones are the corners of the user area (inside the border and the title and bottom
// strips).
enum CoordinateOrigin : int {
  OriginBottomLeft = 0,
  OriginTopLeft = 1,
  OriginBottomRight = 2,
  OriginTopRight = 3,
  OriginInnerBottomLeft = 4,
  OriginInnerTopLeft = 5,
  OriginInnerBottomRight = 6,
  OriginInnerTopRight = 7,
};

// The frame a panel draws round a child, in the ring kSurroundWidth pixels just outside it.
enum WidgetSurround : int {
  SurroundNone = 0,
  SurroundRaised = 1,
  SurroundSunken = 2,
  SurroundFramed = 3,
};

// Where a relatively placed widget goes with respect to its reference widget.
enum WidgetRelativity : int {
  PlaceAbove = 0,
  PlaceBelow = 1,
  PlaceLeftOf = 2,
  PlaceRightOf = 3,
};

// Which edges line up across the relation: left, right or centre for PlaceAbove and
// PlaceBelow; top, bottom or centre for PlaceLeftOf and PlaceRightOf. An alignment across the
// relation (AlignTop with PlaceAbove, say) is refused.
enum WidgetAlignment : int {
  AlignLeft = 0,
  AlignRight = 1,
  AlignTop = 2,
  AlignBottom = 3,
  AlignCentre = 4,
};

// Standard-widget flags of StandardPanel::addStandardWidgets.
enum StandardWidgetFlag : int {
  StdPootButton = 0x01,
  StdSettingsButton = 0x02,
  StdSizeButton = 0x04,
  StdDoItButton = 0x08,
  StdPinButton = 0x10,
  StdTitleBox = 0x20,
  StdEditableTitleBox = 0x40,
};
constexpr int kStdTitleStripFlags = StdPootButton | StdSettingsButton | StdSizeButton |
                                    StdPinButton | StdTitleBox | StdEditableTitleBox;
constexpr int kStdBottomStripFlags = StdDoItButton;
constexpr int kStdAllFlags = kStdTitleStripFlags | kStdBottomStripFlags;
