#pragma once
// One page of a tabbed dialogue as its tab strip keeps it.
#include "foundation/ValAdaptorBase.h"
#include "platform/glob/Colour.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/Ptr.h"
#include "platform/kw/String.h"

#include "buttons/Checkbox.h"

// The colour that stands for the look's default (fully transparent).
inline constexpr Colour kTabDefaultColour(0.0, 0.0, 0.0, 0.0);

struct TabRec {
  WString pageId;
  WString name;  // what the tab shows
  // Colours; a fully transparent colour stands for the look's default.
  Colour face = kTabDefaultColour;
  Colour text = kTabDefaultColour;
  // The container of the page's widgets; null for a lazy page not yet built.
  GlobHandle<> page;
  // The optional check box on the tab.
  GlobHandle<Checkbox> checkbox;
  bool checkboxState = false;
  Kw::Ptr<ValAdaptorBase<bool>> adaptor;
  // Lazy pages: whether buildPage has run, and the description given when deferred.
  bool built = true;
  WString description;
  // The width of `name` as the tab draws it, measured when the name is set.
  int nameWidth = 0;

  void setPageBaseGlob(Glob* g) { page = GlobHandle<>(g); }
  Glob* getPageBaseGlob() const { return page.get(); }
};
