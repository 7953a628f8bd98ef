#pragma once
// The observer side of an observable value, without its type. A client may follow several
// servers; they are numbered in the order it registered with them. A client destroyed before
// its servers deregisters from all of them; a server destroyed first is forgotten by the
// client (the remaining servers move down one index) and reported by valServerDestroyedNtfy.
#include <vector>

class ValServerBase;

class ValClientBase {
 public:
  ValClientBase() = default;
  virtual ~ValClientBase();
  ValClientBase(const ValClientBase&) = delete;
  ValClientBase& operator=(const ValClientBase&) = delete;

  // After a server's value changed.
  virtual void valChangedNtfy() {}
  // Before a server's value changes; only sent to clients that asked for it.
  virtual void valPreChangedNtfy() {}
  // A server this client followed is being destroyed; it is already forgotten here.
  virtual void valServerDestroyedNtfy(ValServerBase* server) {}

  bool deregisterFrom(ValServerBase* server);
  void deregisterFromAll();
  unsigned numValServers() const { return static_cast<unsigned>(servers_.size()); }
  // Null for an index past the last server.
  ValServerBase* getValServerBase(unsigned index) const;
  bool isRegisteredWith(const ValServerBase* server) const;

  void requestPreChangeNtfy(bool want) { wantsPreChange_ = want; }
  bool wantsPreChangeNtfy() const { return wantsPreChange_; }

 protected:
  // False for null or for a server already followed. The typed client is the public door.
  bool registerWithBase(ValServerBase* server);

 private:
  friend class ValServerBase;
  void serverDestroyed(ValServerBase* server);

  std::vector<ValServerBase*> servers_;
  bool wantsPreChange_ = false;
};
