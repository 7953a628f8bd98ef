#include "platform/backend/WindowBackend.h"

#include <algorithm>
#include <cstdlib>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/WindowsClipboard.h"
#include "platform/os/OS.h"

namespace {

// A display to open the window on, or a video driver chosen explicitly (SDL's display-less
// drivers serve tests).
bool displayAvailable() {
  const char* x = std::getenv("DISPLAY");
  const char* w = std::getenv("WAYLAND_DISPLAY");
  const char* driver = SDL_GetHint(SDL_HINT_VIDEODRIVER);
  return (x && *x) || (w && *w) || (driver && *driver);
}

}  // namespace

std::unique_ptr<WindowBackend> WindowBackend::open(const String& title, int width, int height) {
  if (!displayAvailable()) {
    diagWarning("window: no display (DISPLAY and WAYLAND_DISPLAY are unset)\n");
    return nullptr;
  }
  std::unique_ptr<WindowBackend> b(new WindowBackend());
  if (!b->create(title, std::max(1, width), std::max(1, height))) return nullptr;
  return b;
}

bool WindowBackend::create(const String& title, int width, int height) {
  if (SDL_InitSubSystem(SDL_INIT_VIDEO) != 0) {
    diagWarning(String("window: SDL cannot start its video: ") + SDL_GetError() + "\n");
    return false;
  }
  sdlStarted_ = true;
  window_ = SDL_CreateWindow(title.c_str(), SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED, width,
                             height, SDL_WINDOW_RESIZABLE | SDL_WINDOW_ALLOW_HIGHDPI);
  if (!window_) {
    diagWarning(String("window: SDL cannot open a window: ") + SDL_GetError() + "\n");
    return false;
  }
  sdlRenderer_ = SDL_CreateRenderer(window_, -1, 0);
  if (!sdlRenderer_) sdlRenderer_ = SDL_CreateRenderer(window_, -1, SDL_RENDERER_SOFTWARE);
  if (!sdlRenderer_) {
    diagWarning(String("window: SDL cannot draw into the window: ") + SDL_GetError() + "\n");
    return false;
  }
  SDL_GetWindowSize(window_, &geometry_.windowWidth, &geometry_.windowHeight);
  SDL_GetRendererOutputSize(sdlRenderer_, &geometry_.rootWidth, &geometry_.rootHeight);
  root_ = std::make_unique<RootGlob>(std::max(1, geometry_.rootWidth),
                                     std::max(1, geometry_.rootHeight));
  image_ = std::make_unique<RootRenderer>(*root_);
  if (!makeTexture()) return false;
  cursors_ = std::make_unique<SdlCursorSet>();
  clipboard_ = std::make_unique<SdlClipboardProvider>();
  WindowsClipboard::setProvider(clipboard_.get());
  SDL_StartTextInput();
  OS()->keyboard().setModifiers(SdlInputTranslator::modifierBits(SDL_GetModState()));
  return true;
}

WindowBackend::~WindowBackend() {
  // The Globs go first: they may still reach the screen while they are deleted.
  root_.reset();
  cursors_.reset();
  // Someone may have installed another provider since; theirs stays.
  if (clipboard_ && &WindowsClipboard::provider() == clipboard_.get()) {
    WindowsClipboard::setProvider(nullptr);
  }
  clipboard_.reset();
  image_.reset();
  releaseTexture();
  if (sdlRenderer_) SDL_DestroyRenderer(sdlRenderer_);
  if (window_) SDL_DestroyWindow(window_);
  if (sdlStarted_) {
    SDL_StopTextInput();
    SDL_QuitSubSystem(SDL_INIT_VIDEO);
    SDL_Quit();
  }
  OS()->keyboard().setModifiers(0);
}

bool WindowBackend::makeTexture() {
  // The texture is the root's size, as the image becomes at its next repaint.
  const int w = root_->canvas()->width();
  const int h = root_->canvas()->height();
  // Cairo's ARGB32 is a native-endian 32-bit word with alpha on top: SDL's ARGB8888.
  texture_ =
      SDL_CreateTexture(sdlRenderer_, SDL_PIXELFORMAT_ARGB8888, SDL_TEXTUREACCESS_STREAMING, w, h);
  if (!texture_) {
    diagError(String("window: SDL cannot make a texture: ") + SDL_GetError() + "\n");
    return false;
  }
  SDL_SetTextureBlendMode(texture_, SDL_BLENDMODE_NONE);
  needsPresent_ = true;
  return true;
}

void WindowBackend::releaseTexture() {
  if (texture_) SDL_DestroyTexture(texture_);
  texture_ = nullptr;
}

double WindowBackend::pixelScale() const {
  return static_cast<double>(geometry_.rootWidth) / std::max(1, geometry_.windowWidth);
}

// --- The loop ---

bool WindowBackend::step(int waitMs) {
  // Wake in time for the next tick even when no input comes.
  const int wait = std::clamp(waitMs, 0, root_->tickPeriod());
  SDL_Event event;
  if (wait > 0 ? SDL_WaitEventTimeout(&event, wait) : SDL_PollEvent(&event)) {
    handle(event);
    while (!quit_ && SDL_PollEvent(&event)) handle(event);
  }
  root_->processTimers();
  root_->pumpQueue();
  cursors_->show(root_->cursorAtPointer());
  followFocus();
  render();
  return !quit_;
}

void WindowBackend::handle(const SDL_Event& event) {
  // Events of other windows (there are none of ours) are not for this screen.
  if (event.type == SDL_WINDOWEVENT && event.window.windowID != windowId()) return;
  for (const TranslatedInput& input : translator_.translate(event, geometry_)) apply(input);
}

void WindowBackend::apply(const TranslatedInput& in) {
  using Kind = TranslatedInput::Kind;
  switch (in.kind) {
    case Kind::Mouse:
      // Controls read the modifiers of a click from OS().
      OS()->keyboard().setModifiers(SdlInputTranslator::modifierBits(SDL_GetModState()));
      root_->injectMouse(in.type, in.pos, in.wheelSteps);
      break;
    case Kind::Key:
      root_->injectKey(in.type, in.keyCode);
      break;
    case Kind::ComposedText:
      deliverComposedText(in.text);
      break;
    case Kind::Modifiers:
      OS()->keyboard().setModifiers(in.modifiers);
      break;
    case Kind::Resized:
      fitToWindow();
      break;
    case Kind::Exposed:
      needsPresent_ = true;
      break;
    case Kind::FocusLost:
      OS()->keyboard().setModifiers(0);
      break;
    case Kind::Quit:
      quit_ = true;
      break;
  }
}

void WindowBackend::deliverComposedText(const String& utf8) {
  // Typed text goes where keys go, so never past an input scope; nowhere without a focus.
  Glob* focus = root_->keyTarget();
  if (focus == root_.get()) return;
  Event e(kEventMessage);
  e.message(kMsgCompoundTextInput);
  e.setPayload(utf8);
  e.dest = focus;
  e.canvas = focus->canvas();
  event_send(&e, false);
}

void WindowBackend::fitToWindow() {
  WindowGeometry g;
  SDL_GetWindowSize(window_, &g.windowWidth, &g.windowHeight);
  SDL_GetRendererOutputSize(sdlRenderer_, &g.rootWidth, &g.rootHeight);
  const bool resized = g.rootWidth != geometry_.rootWidth || g.rootHeight != geometry_.rootHeight;
  geometry_ = g;
  if (!resized) return;
  releaseTexture();
  // Reshaping the root damages all of it: the next repaint makes the image the new size and
  // fills it, and all of it goes up to the new texture.
  root_->reshape_canvas(0, 0, std::max(1, g.rootWidth), std::max(1, g.rootHeight));
  if (!makeTexture()) quit_ = true;
}

void WindowBackend::followFocus() {
  // Puts the input method's window under the Glob that receives typed text.
  Glob* focus = root_->focus();
  if (inputFocus_.refersTo(focus) && inputFocus_.alive()) return;
  inputFocus_ = GlobHandle<>(focus);
  if (!focus) return;
  const Kw::Box<int> r = focus->canvas()->rootRect();
  const double s = std::max(pixelScale(), 1e-6);
  SDL_Rect rect{static_cast<int>(r.x0 / s), static_cast<int>((geometry_.rootHeight - r.y1) / s),
                static_cast<int>(r.width() / s), static_cast<int>(r.height() / s)};
  SDL_SetTextInputRect(&rect);
}

// --- Painting ---

void WindowBackend::render() {
  if (image_->render() && texture_) upload(image_->presentedAreas());
  present();
}

void WindowBackend::upload(const std::vector<Kw::Box<int>>& areas) {
  cairo_surface_t* image = image_->surface();
  cairo_surface_flush(image);
  const Kw::Box<int> bounds(0, 0, image_->width(), image_->height());
  const unsigned char* pixels = cairo_image_surface_get_data(image);
  const int stride = cairo_image_surface_get_stride(image);
  for (const auto& a : areas) {
    const Kw::Box<int> r = a.intersection(bounds);
    if (r.empty()) continue;
    const SDL_Rect rect{r.x0, r.y0, r.width(), r.height()};
    SDL_UpdateTexture(texture_, &rect, pixels + r.y0 * stride + r.x0 * 4, stride);
    needsPresent_ = true;
  }
}

void WindowBackend::present() {
  if (!needsPresent_ || !texture_) return;
  needsPresent_ = false;
  // The window's back buffer is not kept between frames, so the whole texture is copied; only
  // the changed rectangles travel from the image to the texture.
  SDL_RenderCopy(sdlRenderer_, texture_, nullptr, nullptr);
  SDL_RenderPresent(sdlRenderer_);
}

bool WindowBackend::screenshot(const String& pngPath) {
  render();
  return image_->writePng(pngPath, root_->canvas()->rootRect());
}

bool WindowBackend::screenshot(const Glob& glob, const String& pngPath) {
  render();
  return image_->writePng(pngPath, glob);
}
