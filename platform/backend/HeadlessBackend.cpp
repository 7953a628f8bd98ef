#include "platform/backend/HeadlessBackend.h"

#include <algorithm>

HeadlessBackend::HeadlessBackend(int width, int height)
    : root_(std::make_unique<RootGlob>(std::max(1, width), std::max(1, height))),
      renderer_(std::make_unique<RootRenderer>(*root_)) {}

HeadlessBackend::~HeadlessBackend() {
  renderer_.reset();
  root_.reset();
}

bool HeadlessBackend::step(int) {
  root_->processTimers();
  root_->pumpQueue();
  renderer_->render();
  return !quit_;
}

bool HeadlessBackend::screenshot(const String& pngPath) {
  renderer_->render();
  return renderer_->writePng(pngPath, root_->canvas()->rootRect());
}

bool HeadlessBackend::screenshot(const Glob& glob, const String& pngPath) {
  renderer_->render();
  return renderer_->writePng(pngPath, glob);
}
