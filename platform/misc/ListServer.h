#pragma once
// An observable list of texts. Its clients hear of each insertion, removal and change by the
// index it concerns. A server destroyed before its clients makes each of them forget it.
#include <vector>

#include "platform/kw/String.h"
#include "platform/misc/ObserverList.h"

class ListClient;

class ListServer {
 public:
  static constexpr unsigned kAtEnd = 0xFFFFFFFF;

  ListServer() = default;
  ~ListServer();
  ListServer(const ListServer&) = delete;
  ListServer& operator=(const ListServer&) = delete;

  unsigned size() const { return static_cast<unsigned>(items_.size()); }
  // Empty for an index past the end.
  WString item(unsigned index) const;

  // Inserts before `index` (kAtEnd or any index past the end appends). Returns the index used.
  unsigned addItem(const WString& text, unsigned index = kAtEnd);
  // False for an index past the end.
  bool removeItem(unsigned index);
  // False for an index past the end; an unchanged text tells no one and returns true.
  bool setItem(unsigned index, const WString& text);

  size_t numListClients() const { return clients_.size(); }

 private:
  friend class ListClient;

  std::vector<WString> items_;
  ObserverList<ListClient> clients_;
};
