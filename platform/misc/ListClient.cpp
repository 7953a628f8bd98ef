#include "platform/misc/ListClient.h"

#include "platform/misc/ListServer.h"

ListClient::~ListClient() {
  deregisterFromList();
}

bool ListClient::registerWith(ListServer* server) {
  if (!server || server == server_) return false;
  deregisterFromList();
  server_ = server;
  server->clients_.add(this);
  return true;
}

void ListClient::deregisterFromList() {
  if (!server_) return;
  server_->clients_.remove(this);
  server_ = nullptr;
}

void ListClient::serverDestroyed() {
  server_->clients_.remove(this);
  server_ = nullptr;
  listServerDestroyedNtfy();
}
