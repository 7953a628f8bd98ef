#include "platform/backend/RootRenderer.h"

#include <algorithm>

#include "platform/misc/Diagnostics.h"
#include "platform/os/LargeBlock.h"

RootRenderer::RootRenderer(RootGlob& root) : root_(root), rootAlive_(&root) {
  makeSurface(root.canvas()->width(), root.canvas()->height());
  root_.setUnbufferedPainter([this](const Kw::Box<int>& area) { return renderNow(area); });
}

RootRenderer::~RootRenderer() {
  if (RootGlob* root = rootAlive_.get()) root->setUnbufferedPainter(nullptr);
  session_.reset();
  cairo_surface_destroy(surface_);
}

namespace {

// The screen's pixels live in a large block of their own; the image gives it back when it goes.
struct ImageBlock {
  void* pixels;
  std::size_t bytes;
};

const cairo_user_data_key_t kImageBlockKey{};

void releaseImageBlock(void* data) {
  auto* block = static_cast<ImageBlock*>(data);
  LargeBlock::release(block->pixels, block->bytes);
  delete block;
}

cairo_surface_t* makeImage(int width, int height) {
  const int stride = cairo_format_stride_for_width(CAIRO_FORMAT_ARGB32, width);
  const std::size_t bytes = static_cast<std::size_t>(stride) * static_cast<std::size_t>(height);
  void* pixels = stride > 0 ? LargeBlock::allocate(bytes) : nullptr;
  if (!pixels) return cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width, height);
  cairo_surface_t* s = cairo_image_surface_create_for_data(
      static_cast<unsigned char*>(pixels), CAIRO_FORMAT_ARGB32, width, height, stride);
  auto* block = new ImageBlock{pixels, bytes};
  if (cairo_surface_set_user_data(s, &kImageBlockKey, block, releaseImageBlock) !=
      CAIRO_STATUS_SUCCESS) {
    // Without the release the block would leak: an image of cairo's own instead.
    cairo_surface_destroy(s);
    releaseImageBlock(block);
    return cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width, height);
  }
  return s;
}

}  // namespace

void RootRenderer::makeSurface(int width, int height) {
  session_.reset();
  if (surface_) cairo_surface_destroy(surface_);
  surface_ = makeImage(std::max(1, width), std::max(1, height));
  session_ = std::make_unique<Glib::CairoPaintSession>(surface_);
  // A new image holds nothing yet: all of it must be painted.
  root_.canvas()->damage();
}

bool RootRenderer::render() {
  const Canvas* c = root_.canvas();
  if (c->width() != width() || c->height() != height()) makeSurface(c->width(), c->height());
  const bool painted = root_.paint(*session_);
  if (!painted && unbufferedSinceRender_.empty()) return false;
  presented_ = std::move(unbufferedSinceRender_);
  unbufferedSinceRender_.clear();
  if (painted) {
    const auto& frame = session_->presentedAreas();
    presented_.insert(presented_.end(), frame.begin(), frame.end());
  }
  for (const auto& a : presented_) changed_ = changed_.united(a);
  return true;
}

bool RootRenderer::renderNow(const Kw::Box<int>& rootArea) {
  // A screen that changed size since the last render has no image of its size yet.
  const Canvas* c = root_.canvas();
  if (c->width() != width() || c->height() != height()) return false;
  if (!root_.paintAreas(*session_, {rootArea})) return false;
  const auto& frame = session_->presentedAreas();
  unbufferedSinceRender_.insert(unbufferedSinceRender_.end(), frame.begin(), frame.end());
  return true;
}

Kw::Box<int> RootRenderer::takeChanged() {
  const Kw::Box<int> out = changed_;
  changed_ = Kw::Box<int>();
  return out;
}

uint32_t RootRenderer::pixelAt(XY<int> p) const {
  if (p.x < 0 || p.y < 0 || p.x >= width() || p.y >= height()) return 0;
  const unsigned char* data = cairo_image_surface_get_data(surface_);
  const int stride = cairo_image_surface_get_stride(surface_);
  const int row = height() - 1 - p.y;
  return reinterpret_cast<const uint32_t*>(data + row * stride)[p.x];
}

cairo_surface_t* RootRenderer::copyArea(const Kw::Box<int>& rootArea) const {
  const Kw::Box<int> a = rootArea.intersection(Kw::Box<int>(0, 0, width(), height()));
  if (a.empty()) return nullptr;
  cairo_surface_t* out = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, a.width(), a.height());
  cairo_t* cr = cairo_create(out);
  cairo_set_operator(cr, CAIRO_OPERATOR_SOURCE);
  cairo_set_source_surface(cr, surface_, -a.x0, -(height() - a.y1));
  cairo_paint(cr);
  cairo_destroy(cr);
  cairo_surface_flush(out);
  return out;
}

bool RootRenderer::writePng(const String& path, const Kw::Box<int>& rootArea) const {
  cairo_surface_t* area = copyArea(rootArea);
  if (!area) {
    diagWarning("screenshot: nothing of the requested area is on screen: " + path + "\n");
    return false;
  }
  const cairo_status_t st = cairo_surface_write_to_png(area, path.c_str());
  cairo_surface_destroy(area);
  if (st != CAIRO_STATUS_SUCCESS) {
    diagWarning("screenshot: cannot write " + path + ": " + cairo_status_to_string(st) + "\n");
    return false;
  }
  return true;
}

bool RootRenderer::writePng(const String& path, const Glob& glob) const {
  if (!is_good_glob_ptr(&glob) || glob.root() != &root_ || !glob.canvas()->isMappedToRoot()) {
    diagWarning("screenshot: the Glob is not shown on this screen: " + path + "\n");
    return false;
  }
  return writePng(path, glob.canvas()->visibleRootRect());
}
