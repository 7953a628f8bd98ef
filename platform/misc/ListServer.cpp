#include "platform/misc/ListServer.h"

#include "platform/misc/ListClient.h"

ListServer::~ListServer() {
  clients_.forEach([](ListClient* c) { c->serverDestroyed(); });
}

WString ListServer::item(unsigned index) const {
  return index < items_.size() ? items_[index] : WString();
}

unsigned ListServer::addItem(const WString& text, unsigned index) {
  if (index > items_.size()) index = size();
  items_.insert(items_.begin() + index, text);
  clients_.forEach([index](ListClient* c) { c->itemAdded(index); });
  return index;
}

bool ListServer::removeItem(unsigned index) {
  if (index >= items_.size()) return false;
  items_.erase(items_.begin() + index);
  clients_.forEach([index](ListClient* c) { c->itemDeleted(index); });
  return true;
}

bool ListServer::setItem(unsigned index, const WString& text) {
  if (index >= items_.size()) return false;
  if (items_[index] == text) return true;
  items_[index] = text;
  clients_.forEach([index](ListClient* c) { c->itemUpdated(index); });
  return true;
}
