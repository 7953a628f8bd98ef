#pragma once
// Why a control asks for a new model value. Controls pass it through to their adaptor
// unchanged; an adaptor may, for example, record undo only at a drag's release.
enum DataChangeType : int {
  kChangeDragStart = 0,
  kChangeDragStep = 1,
  kChangeDragRelease = 2,
  kChangeDirect = 3,
  kChangeUserToggle = 4,  // the user flipped a two-state control (a check box)
};
