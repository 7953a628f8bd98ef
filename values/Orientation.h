#pragma once
// Which way a slider or scroll bar runs.
enum Orientation : int { kHorizontal = 0, kVertical = 1 };
