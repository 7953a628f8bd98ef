#pragma once
// How many times each address was entered: a multiset of pointers in one flat table.
//
// Open addressing with linear probing, at most half full, and backward-shift removal (no
// tombstones), so a container that enters and takes out thousands of children costs one
// array and never a node per entry. Addresses are identities only and are never followed.
#include <cstddef>
#include <cstdint>
#include <vector>

namespace Kw {

class AddressCounts {
 public:
  void add(const void* address);
  // One entry of `address` fewer; false (and nothing changes) when there is none.
  bool remove(const void* address);
  bool contains(const void* address) const;
  unsigned count(const void* address) const;
  // Distinct addresses held.
  std::size_t size() const { return used_; }
  void clear();

 private:
  struct Slot {
    const void* address = nullptr;  // null: empty
    unsigned count = 0;
  };

  std::size_t home(const void* address) const;
  // The slot holding `address`, or the empty slot where it would go.
  std::size_t find(const void* address) const;
  void grow();

  std::vector<Slot> slots_;  // a power of two long, or empty
  std::size_t used_ = 0;
};

}  // namespace Kw
