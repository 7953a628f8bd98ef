#include "foundation/ListViewWidget.h"

#include "foundation/ListViewAdaptorBase.h"
#include "platform/glob/Drawable.h"

void ListViewWidget::setDataAdaptor(Kw::Ptr<ListViewAdaptorBase> a) {
  setAdaptor(Kw::Ptr<AdaptorBase>(a));
}

Kw::Ptr<ListViewAdaptorBase> ListViewWidget::getDataAdaptor() const {
  return Kw::ptr_cast<ListViewAdaptorBase>(adaptor);
}

bool ListViewWidget::requestItemSelect(unsigned index) {
  const Kw::Ptr<ListViewAdaptorBase> a = getDataAdaptor();
  if (!a) return true;
  Drawable::disableRedraws();
  const bool accepted = a->requestItemSelect(index);
  Drawable::enableRedraws();
  return accepted;
}

unsigned ListViewWidget::getSize() const {
  const Kw::Ptr<ListViewAdaptorBase> a = getDataAdaptor();
  return a ? a->getSize() : 0;
}

WString ListViewWidget::operator[](unsigned index) const {
  const Kw::Ptr<ListViewAdaptorBase> a = getDataAdaptor();
  return a ? a->itemText(index) : WString();
}
