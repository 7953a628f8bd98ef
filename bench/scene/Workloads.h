#pragma once
// The workloads of the scene benchmark, each printing its result lines.

namespace scene {

// W1: build and destroy S(100), S(1000), S(10000), directly and through addWidget.
void runBuildAndDestroy();
// W2: whole frames of S(1000); W3: one label change through the damage path.
void runFrames();
// W4: pointer moves and clicks over S(1000).
void runInput();
// W5: bytes per control of S(10000), peak and resident set and heap.
void runMemory();
// W6: a pop-up menu of 100,000 items built, shown and scrolled by pages.
void runMenu();
// The size of every control class.
void reportSizes(bool asNotes);

}  // namespace scene
