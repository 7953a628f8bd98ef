// The benchmark scene S(N) with the library's own controls, measured the way the peers'
// benchmarks measure theirs. Usage: scene [main [OUTDIR] | w1 | w5 | w6 | sizes]
#include <cstdio>
#include <string>

#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"

int main(int argc, char** argv) {
  const std::string mode = argc > 1 ? argv[1] : "main";
  if (mode == "main") {
    scene::calibrate();
    scene::runBuildAndDestroy();
    scene::runFrames();
    scene::runInput();
    scene::reportSizes(true);
  } else if (mode == "w1") {
    scene::runBuildAndDestroy();
  } else if (mode == "w5") {
    scene::runMemory();
  } else if (mode == "w6") {
    scene::runMenu();
  } else if (mode == "sizes") {
    scene::reportSizes(false);
  } else {
    std::fprintf(stderr, "usage: scene [main [OUTDIR] | w1 | w5 | w6 | sizes]\n");
    return 2;
  }
  return 0;
}
