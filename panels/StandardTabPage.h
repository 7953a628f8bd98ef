#pragma once
// The page a tabbed dialogue makes for createStandardPage: a borderless standard panel that
// fills the page area and places its widgets by the panel's rules, so it lays itself out
// whenever its size changes (a lazy dialogue resizes it rather than calling reshapePage).
// A taggable page carries a tag that the dialogue shows as a check box on its tab.
#include "panels/StandardPanel.h"

class StandardTabPage : public StandardPanel {
 public:
  StandardTabPage(const GlobCreationInfo& info, bool taggable);

  bool isTaggable() const { return taggable_; }
  // Scales the page by the factors (1.0, 1.0 places the widgets again at the same size).
  void resize(double fx, double fy);
  const char* idstring() const override { return "tabpage"; }

 private:
  bool taggable_ = false;
};
