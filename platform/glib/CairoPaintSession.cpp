#include "platform/glib/CairoPaintSession.h"

#include <algorithm>

#include "platform/glob/Canvas.h"

namespace Glib {

CairoPaintSession::CairoPaintSession(cairo_surface_t* surface)
    : surface_(surface),
      cr_(cairo_create(surface)),
      target_(pixman_image_create_bits(
          PIXMAN_a8r8g8b8, cairo_image_surface_get_width(surface),
          cairo_image_surface_get_height(surface),
          reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(surface)),
          cairo_image_surface_get_stride(surface))),
      rootHeight_(cairo_image_surface_get_height(surface)) {
  pixman_region32_init(&frame_);
  pixman_region32_init(&clip_);
}

CairoPaintSession::~CairoPaintSession() {
  for (const Solid& s : solids_) pixman_image_unref(s.image);
  pixman_region32_fini(&clip_);
  pixman_region32_fini(&frame_);
  pixman_image_unref(target_);
  cairo_destroy(cr_);
}

Kw::Box<int> CairoPaintSession::topDown(const Kw::Box<int>& b) const {
  return Kw::Box<int>(b.x0, rootHeight_ - b.y1, b.x1, rootHeight_ - b.y0);
}

void CairoPaintSession::beginFrame(const std::vector<Kw::Box<int>>& areas) {
  presented_.clear();
  scratch_.clear();
  for (const auto& a : areas) {
    const Kw::Box<int> t = topDown(a);
    presented_.push_back(t);
    scratch_.push_back({t.x0, t.y0, t.x1, t.y1});
  }
  pixman_region32_fini(&frame_);
  pixman_region32_init_rects(&frame_, scratch_.data(), static_cast<int>(scratch_.size()));
  cairo_surface_flush(surface_);
  // Pixels are about to be written behind Cairo's back: it must not assume the image is still
  // clear (it would then composite as if onto nothing).
  cairo_surface_mark_dirty(surface_);
}

void CairoPaintSession::endFrame(const std::vector<Kw::Box<int>>&) {
  // Pixels were written behind Cairo's back.
  cairo_surface_mark_dirty(surface_);
  cairo_surface_flush(surface_);
}

void CairoPaintSession::beginCanvas(Canvas& canvas, const Kw::Box<int>& clip,
                                    const std::vector<Kw::Box<int>>& covered) {
  current_ = &canvas;
  contextReady_ = false;
  const Kw::Box<int> c = topDown(clip);
  pixman_region32_intersect_rect(&clip_, &frame_, c.x0, c.y0, static_cast<unsigned>(c.width()),
                                 static_cast<unsigned>(c.height()));
  if (!covered.empty()) {
    scratch_.clear();
    for (const auto& b : covered) {
      const Kw::Box<int> t = topDown(b);
      scratch_.push_back({t.x0, t.y0, t.x1, t.y1});
    }
    pixman_region32_t hidden;
    pixman_region32_init_rects(&hidden, scratch_.data(), static_cast<int>(scratch_.size()));
    pixman_region32_subtract(&clip_, &clip_, &hidden);
    pixman_region32_fini(&hidden);
  }
  pixman_image_set_clip_region32(target_, &clip_);
  activeClip_ = &clip_;
  const Kw::Box<int> r = topDown(canvas.rootRect());
  origin_ = XY<int>(r.x0, r.y0);
}

cairo_t* CairoPaintSession::context() {
  if (!current_) return nullptr;
  if (!contextReady_) {
    cairo_save(cr_);
    int n = 0;
    const pixman_box32_t* boxes = pixman_region32_rectangles(&clip_, &n);
    for (int i = 0; i < n; ++i) {
      cairo_rectangle(cr_, boxes[i].x1, boxes[i].y1, boxes[i].x2 - boxes[i].x1,
                      boxes[i].y2 - boxes[i].y1);
    }
    if (n == 0) cairo_rectangle(cr_, 0, 0, 0, 0);
    cairo_clip(cr_);
    cairo_translate(cr_, origin_.x, origin_.y);
    contextReady_ = true;
  }
  return cr_;
}

void CairoPaintSession::setTargetClip(const pixman_region32_t* region) {
  activeClip_ = region ? region : &clip_;
  // Pixman copies the region; it only lacks the const in its declaration.
  pixman_image_set_clip_region32(target_, const_cast<pixman_region32_t*>(region ? region : &clip_));
}

void CairoPaintSession::endCanvas(Canvas&) {
  if (contextReady_) cairo_restore(cr_);
  contextReady_ = false;
  current_ = nullptr;
  pixman_image_set_clip_region32(target_, nullptr);
}

namespace {
// Pixels from which a fill goes to pixman's block fill.
constexpr int kLargeFill = 4096;
}  // namespace

void CairoPaintSession::fillOpaque(const pixman_box32_t& box, uint32_t pixel) {
  int n = 0;
  const pixman_box32_t* clip = pixman_region32_rectangles(activeClip_, &n);
  auto* bits = reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(surface_));
  const int stride = cairo_image_surface_get_stride(surface_) / 4;
  for (int i = 0; i < n; ++i) {
    const int x0 = std::max(box.x1, clip[i].x1);
    const int y0 = std::max(box.y1, clip[i].y1);
    const int x1 = std::min(box.x2, clip[i].x2);
    const int y1 = std::min(box.y2, clip[i].y2);
    if (x1 <= x0 || y1 <= y0) continue;
    const int w = x1 - x0;
    if (w * (y1 - y0) >= kLargeFill) {
      pixman_fill(bits, stride, 32, x0, y0, w, y1 - y0, pixel);
      continue;
    }
    // Most boxes are a bevel's edge or a gradient's row: plain stores beat the general fill's
    // dispatch there.
    for (int y = y0; y < y1; ++y) std::fill_n(bits + y * stride + x0, w, pixel);
  }
}

pixman_image_t* CairoPaintSession::solid(const pixman_color_t& c) {
  for (size_t i = solids_.size(); i-- > 0;) {
    const pixman_color_t& k = solids_[i].colour;
    if (k.red == c.red && k.green == c.green && k.blue == c.blue && k.alpha == c.alpha) {
      return solids_[i].image;
    }
  }
  // A handful of colours covers a frame; the oldest goes first.
  constexpr size_t kKept = 16;
  if (solids_.size() == kKept) {
    pixman_image_unref(solids_.front().image);
    solids_.erase(solids_.begin());
  }
  solids_.push_back({c, pixman_image_create_solid_fill(&c)});
  return solids_.back().image;
}

void CairoPaintSession::fillCanvas(const Colour& colour) {
  if (!current_) return;
  int n = 0;
  const pixman_box32_t* boxes = pixman_region32_rectangles(&clip_, &n);
  if (n == 0) return;
  const double a = colour.a;
  auto c16 = [](double v) {
    return static_cast<uint16_t>(v <= 0 ? 0 : v >= 1 ? 65535 : v * 65535 + 0.5);
  };
  const pixman_color_t pc{c16(colour.r * a), c16(colour.g * a), c16(colour.b * a), c16(a)};
  pixman_image_fill_boxes(PIXMAN_OP_SRC, target_, &pc, n, boxes);
}

}  // namespace Glib
