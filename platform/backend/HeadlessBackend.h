#pragma once
// The back end without a window: the screen is an image in memory. Input comes from whoever
// drives the root (tests, scripts); a step runs due ticks, delivers queued messages and
// repaints the damage, and never waits.
#include <memory>

#include "platform/backend/Backend.h"
#include "platform/backend/RootRenderer.h"

class HeadlessBackend : public Backend {
 public:
  HeadlessBackend(int width, int height);
  ~HeadlessBackend() override;

  RootGlob& root() override { return *root_; }
  bool step(int waitMs) override;
  cairo_surface_t* surface() override { return renderer_->surface(); }
  void render() override { renderer_->render(); }
  bool screenshot(const String& pngPath) override;
  bool screenshot(const Glob& glob, const String& pngPath) override;

  // Makes the next step report that the loop should end.
  void requestQuit() { quit_ = true; }
  RootRenderer& renderer() { return *renderer_; }

 private:
  std::unique_ptr<RootGlob> root_;
  std::unique_ptr<RootRenderer> renderer_;
  bool quit_ = false;
};
