#pragma once
// The observer of one or more ValServer<T>.
#include "platform/misc/ValClientBase.h"
#include "platform/misc/ValServer.h"

template <typename T>
class ValClient : public ValClientBase {
 public:
  bool registerWith(ValServer<T>* server) { return registerWithBase(server); }
  // The index-th server followed, or null.
  ValServer<T>* getValServer(unsigned index) const {
    // Only typed servers get in, through registerWith.
    return static_cast<ValServer<T>*>(getValServerBase(index));
  }
};
