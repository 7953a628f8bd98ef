#pragma once
// The screen in a real, resizable SDL window. Each step takes the window's input and feeds it
// to the root, fires due ticks, delivers queued messages, repaints the damage through the
// screen's RootRenderer and uploads only the areas it repainted to the window's texture. While it
// lives the keyboard modifiers of OS() follow the real keys, the pointer takes the shape the Glob
// under it asks for, and the library's clipboard is the system's.
//
// The root counts drawable pixels: on a HiDPI screen it is larger than the window's size in
// window units, by pixelScale(), and pointer positions are scaled to match.
#include <SDL.h>

#include <memory>

#include "platform/backend/Backend.h"
#include "platform/backend/RootRenderer.h"
#include "platform/backend/SdlClipboardProvider.h"
#include "platform/backend/SdlCursorSet.h"
#include "platform/backend/SdlInputTranslator.h"
#include "platform/glob/GlobHandle.h"

class WindowBackend : public Backend {
 public:
  // Opens a window of `width` x `height` window units. Null when there is no display (and no
  // SDL video driver named explicitly) or SDL cannot make the window (the reason goes through
  // Diagnostics); callers fall back to a headless screen.
  static std::unique_ptr<WindowBackend> open(const String& title, int width, int height);
  ~WindowBackend() override;
  WindowBackend(const WindowBackend&) = delete;
  WindowBackend& operator=(const WindowBackend&) = delete;

  RootGlob& root() override { return *root_; }
  bool step(int waitMs) override;
  cairo_surface_t* surface() override { return image_->surface(); }
  void render() override;
  bool screenshot(const String& pngPath) override;
  bool screenshot(const Glob& glob, const String& pngPath) override;

  // Drawable pixels per window unit, across.
  double pixelScale() const;
  const WindowGeometry& geometry() const { return geometry_; }
  RootRenderer& renderer() { return *image_; }
  // The window's identifier in SDL's numbering.
  Uint32 windowId() const { return SDL_GetWindowID(window_); }

 private:
  WindowBackend() = default;
  bool create(const String& title, int width, int height);
  void handle(const SDL_Event& event);
  void apply(const TranslatedInput& input);
  void deliverComposedText(const String& utf8);
  void fitToWindow();
  bool makeTexture();
  void releaseTexture();
  void upload(const std::vector<Kw::Box<int>>& topDownAreas);
  void present();
  void followFocus();

  SDL_Window* window_ = nullptr;
  SDL_Renderer* sdlRenderer_ = nullptr;
  SDL_Texture* texture_ = nullptr;  // the image's size; what the window shows
  std::unique_ptr<RootGlob> root_;
  std::unique_ptr<RootRenderer> image_;
  std::unique_ptr<SdlCursorSet> cursors_;
  std::unique_ptr<SdlClipboardProvider> clipboard_;
  SdlInputTranslator translator_;
  WindowGeometry geometry_;
  GlobHandle<> inputFocus_;  // the Glob the input method's window is placed at
  bool sdlStarted_ = false;
  bool needsPresent_ = true;
  bool quit_ = false;
};
