#include "foundation/ListViewAdaptorBase.h"

#include "foundation/ListViewWidget.h"

ListViewAdaptorBase::ListViewAdaptorBase(ListServer* items, ValServer<unsigned int>* current) {
  if (items) ListClient::registerWith(items);
  if (current) ValClient<unsigned int>::registerWith(current);
}

template <typename Fn>
void ListViewAdaptorBase::forEachList(Fn&& fn) {
  forEachAttached([&fn](WidgetBase* w) {
    if (auto* lw = dynamic_cast<ListViewWidget*>(w)) fn(lw);
  });
}

void ListViewAdaptorBase::itemAdded(unsigned index) {
  forEachList([index](ListViewWidget* w) { w->addItemText(index); });
}

void ListViewAdaptorBase::itemDeleted(unsigned index) {
  forEachList([index](ListViewWidget* w) { w->removeItemText(index); });
}

void ListViewAdaptorBase::itemUpdated(unsigned index) {
  forEachList([index](ListViewWidget* w) { w->itemChanged(index); });
}

bool ListViewAdaptorBase::requestItemSelect(unsigned index) {
  ValServer<unsigned int>* current = getValServer(0);
  if (!current || index >= getSize()) return false;
  current->setValue(index);
  return true;
}

void ListViewAdaptorBase::valChangedNtfy() {
  const unsigned index = getCurrentItem();
  forEachList([index](ListViewWidget* w) { w->setCurrentItem(index); });
}

unsigned ListViewAdaptorBase::getSize() const {
  const ListServer* items = getListServer();
  return items ? items->size() : 0;
}

WString ListViewAdaptorBase::itemText(unsigned index) const {
  const ListServer* items = getListServer();
  return items ? items->item(index) : WString();
}

unsigned ListViewAdaptorBase::getCurrentItem() const {
  const ValServer<unsigned int>* current = getValServer(0);
  return current ? current->getValue() : kNoItem;
}
