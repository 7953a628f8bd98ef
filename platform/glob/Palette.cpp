#include "platform/glob/Palette.h"

#include <algorithm>
#include <utility>

// The standard records are made once and never freed: palettes in static objects may be
// destroyed after them.
Palette::Record* Palette::darkRecord() {
  static Record* r = [] {
    auto* d = new Record;
    auto& c = d->colours;
    c[Window] = Colour::fromHex(0x3C3F44);
    c[WindowText] = Colour::fromHex(0xDCDEE2);
    c[Button] = Colour::fromHex(0x545962);
    c[ButtonText] = Colour::fromHex(0xEEF0F3);
    c[Base] = Colour::fromHex(0x25272B);
    c[Text] = Colour::fromHex(0xE8EAED);
    c[Highlight] = Colour::fromHex(0x3D8FD6);
    c[HighlightedText] = Colour::fromHex(0xFFFFFF);
    c[Light] = Colour::fromHex(0x7A808A);
    c[Shadow] = Colour::fromHex(0x1E2024);
    c[Disabled] = Colour::fromHex(0x8A8E95);
    c[Caret] = Colour::fromHex(0xF5C542);
    c[Focus] = Colour::fromHex(0x6FB3F2);
    c[Border] = Colour::fromHex(0x16181B);
    c[Ghost] = Colour::fromHex(0x7C8088);
    return d;
  }();
  return r;
}

Palette::Record* Palette::lightRecord() {
  static Record* r = [] {
    auto* l = new Record;
    auto& c = l->colours;
    c[Window] = Colour::fromHex(0xE9ECF0);
    c[WindowText] = Colour::fromHex(0x1D2127);
    c[Button] = Colour::fromHex(0xD5DAE1);
    c[ButtonText] = Colour::fromHex(0x14171C);
    c[Base] = Colour::fromHex(0xFFFFFF);
    c[Text] = Colour::fromHex(0x14171C);
    c[Highlight] = Colour::fromHex(0x2A72C4);
    c[HighlightedText] = Colour::fromHex(0xFFFFFF);
    c[Light] = Colour::fromHex(0xFFFFFF);
    c[Shadow] = Colour::fromHex(0x8F96A0);
    c[Disabled] = Colour::fromHex(0x70767F);
    c[Caret] = Colour::fromHex(0xB5470B);
    c[Focus] = Colour::fromHex(0x1F6FD1);
    c[Border] = Colour::fromHex(0x737B86);
    c[Ghost] = Colour::fromHex(0x878E98);
    l->shadeStep = 0.05;
    return l;
  }();
  return r;
}

Palette::Palette(Record* shared) : record_(shared) {
  ++record_->refs;
}

Palette::Palette() : Palette(darkRecord()) {}

Palette Palette::dark() {
  return Palette();
}

Palette Palette::light() {
  return Palette(lightRecord());
}

Palette::Palette(const Colour& fore, const Colour& back) : record_(new Record(*darkRecord())) {
  record_->refs = 1;
  auto& c = record_->colours;
  c[WindowText] = fore;
  c[ButtonText] = fore;
  c[Text] = fore;
  c[Window] = back;
  c[Button] = back;
}

Palette::Palette(const Palette& o) : record_(o.record_) {
  ++record_->refs;
}

Palette::Palette(Palette&& o) noexcept : record_(o.record_) {
  // The moved-from palette keeps a reference, so that it stays usable.
  ++record_->refs;
}

Palette& Palette::operator=(const Palette& o) {
  if (record_ == o.record_) return *this;
  ++o.record_->refs;
  release();
  record_ = o.record_;
  return *this;
}

Palette& Palette::operator=(Palette&& o) noexcept {
  return *this = static_cast<const Palette&>(o);
}

Palette::~Palette() {
  release();
}

void Palette::release() {
  if (--record_->refs == 0) delete record_;
}

Palette::Record& Palette::own() {
  if (record_->refs > 1) {
    auto* copy = new Record(*record_);
    copy->refs = 1;
    release();
    record_ = copy;
  }
  return *record_;
}

void Palette::set(Role role, const Colour& c) {
  own().colours[role] = c;
}

bool Palette::operator==(const Palette& o) const {
  return record_ == o.record_ ||
         (record_->colours == o.record_->colours && record_->shadeStep == o.record_->shadeStep);
}

Colour Palette::windowShade(int level) const {
  level = std::clamp(level, 0, 6);
  // Shade 3 is the window colour itself.
  return scale(record_->colours[Window], 1.0 + record_->shadeStep * (level - 3));
}
