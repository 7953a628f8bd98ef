#pragma once
// The observer of one ListServer. Registering with another server leaves the first.
class ListServer;

class ListClient {
 public:
  ListClient() = default;
  virtual ~ListClient();
  ListClient(const ListClient&) = delete;
  ListClient& operator=(const ListClient&) = delete;

  virtual void itemAdded(unsigned index) {}
  virtual void itemDeleted(unsigned index) {}
  virtual void itemUpdated(unsigned index) {}
  // The server is being destroyed; it is already forgotten here.
  virtual void listServerDestroyedNtfy() {}

  // False for null or the server already followed.
  bool registerWith(ListServer* server);
  void deregisterFromList();
  ListServer* getListServer() const { return server_; }

 private:
  friend class ListServer;
  void serverDestroyed();

  ListServer* server_ = nullptr;
};
