#pragma once
// The sizes a Glob with a size flag shows.
enum size_state : int {
  SizeFull = 0,
  SizeMinimised = 1,  // only the border and the title strip
};
