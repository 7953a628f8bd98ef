#pragma once
// The shade laid over the screen behind a modal panel: it dims what lies beneath and swallows
// every pointer event that reaches it, so that only the modal panel (raised above it) can be
// used.
#include "platform/glob/Glob.h"

class ModalShade : public Glob {
 public:
  // Covers `screen` entirely, in `colour` (usually translucent).
  ModalShade(Glob& screen, const Colour& colour);

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "modal_shade"; }

  const Colour& colour() const { return colour_; }

 private:
  Colour colour_;
};
