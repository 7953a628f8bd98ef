#pragma once
// The adaptor of list controls: follows a ListServer (the items) and a ValServer<unsigned>
// (the current index) and relays their changes to every attached ListViewWidget. Either server
// may be missing or destroyed first: the list then reads as empty and the current index as
// 0xFFFFFFFF (none).
#include "foundation/AdaptorBase.h"
#include "platform/kw/String.h"
#include "platform/misc/ListClient.h"
#include "platform/misc/ListServer.h"
#include "platform/misc/ValClient.h"

class ListViewWidget;

class ListViewAdaptorBase : public AdaptorBase, public ValClient<unsigned int>, public ListClient {
 public:
  static constexpr unsigned kNoItem = 0xFFFFFFFF;

  ListViewAdaptorBase(ListServer* items, ValServer<unsigned int>* current);
  ~ListViewAdaptorBase() override = default;

  using ListClient::registerWith;
  using ValClient<unsigned int>::registerWith;

  void itemAdded(unsigned index) override;
  void itemDeleted(unsigned index) override;
  void itemUpdated(unsigned index) override;
  // A control asks for `index` to become current. The default accepts an index inside the list
  // and writes it to the current-index server; it refuses anything else.
  virtual bool requestItemSelect(unsigned index);
  void valChangedNtfy() override;

  unsigned getSize() const;
  WString itemText(unsigned index) const;
  unsigned getCurrentItem() const;

 private:
  template <typename Fn>
  void forEachList(Fn&& fn);
};
