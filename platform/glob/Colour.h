#pragma once
// An RGBA colour with components in 0..1. Single precision: every control holds several, and
// a float is still far finer than the 16-bit channels the drawing layer hands on.
#include <cstdint>

struct Colour {
  float r = 0.0f, g = 0.0f, b = 0.0f, a = 1.0f;

  constexpr Colour() = default;
  constexpr Colour(double rv, double gv, double bv, double av = 1.0) : r(float(rv)), g(float(gv)), b(float(bv)), a(float(av)) {}
  static constexpr Colour fromRgb8(int r8, int g8, int b8, int a8 = 255) {
    return Colour(r8 / 255.0, g8 / 255.0, b8 / 255.0, a8 / 255.0);
  }
  // 0xRRGGBB.
  static constexpr Colour fromHex(uint32_t rgb) {
    return fromRgb8(int((rgb >> 16) & 0xFF), int((rgb >> 8) & 0xFF), int(rgb & 0xFF));
  }

  bool operator==(const Colour& o) const;
  bool operator!=(const Colour& o) const { return !(*this == o); }
};

// Multiplies the colour components by `factor`, saturating at 0 and 1; alpha is kept.
Colour scale(const Colour& c, double factor);

// Linear blend: t = 0 gives `a`, t = 1 gives `b`.
Colour mix(const Colour& a, const Colour& b, double t);
