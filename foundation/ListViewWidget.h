#pragma once
// The list side of a control that shows a list of texts with one current item. The texts and
// the current index live in the adaptor's model; the control is told of each change by index.
#include "foundation/WidgetBase.h"
#include "platform/kw/String.h"

class ListViewAdaptorBase;

class ListViewWidget : public WidgetBase {
 public:
  ~ListViewWidget() override = default;

  virtual void setDataAdaptor(Kw::Ptr<ListViewAdaptorBase> a);
  // Null when there is none or the held adaptor is not a list adaptor.
  virtual Kw::Ptr<ListViewAdaptorBase> getDataAdaptor() const;

  // The model gained, lost or changed the item at `index`; show it.
  virtual void addItemText(unsigned index) = 0;
  virtual void removeItemText(unsigned index) = 0;
  virtual void itemChanged(unsigned index) = 0;
  // Show `index` (0xFFFFFFFF: none) as the current item. Never calls back into the adaptor.
  virtual void setCurrentItem(unsigned index) = 0;

  // The user picked `index`; true when the model accepted it. True with no adaptor.
  bool requestItemSelect(unsigned index);
  // The model's item count and texts; 0 and empty with no adaptor or past the end.
  unsigned getSize() const;
  WString operator[](unsigned index) const;
};
