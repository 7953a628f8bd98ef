#include "platform/glob/GlobRegistry.h"

#include <algorithm>
#include <cstdlib>
#include <vector>

namespace {

constexpr unsigned kGranuleShift = 3;  // Globs start on 8-byte boundaries
constexpr unsigned kLeafShift = 16;    // one leaf maps 64 KB of addresses
constexpr unsigned kNodeBits = 16;     // leaves per node, and nodes at the top: 48-bit addresses
constexpr size_t kLeafWords = (size_t{1} << (kLeafShift - kGranuleShift)) / 64;

struct Leaf {
  uint64_t bits[kLeafWords];
};
struct Node {
  Leaf* leaves[size_t{1} << kNodeBits];
};

// A slot is its generation: the identity a Glob was given names its slot and the generation
// it had then, and leaving moves the generation on. Four bytes per slot.
using Slot = uint32_t;

struct State {
  std::vector<Slot> slots;
  std::vector<uint32_t> freeSlots;
  uint32_t live = 0;
  Node** nodes = nullptr;                  // 2^16 entries, made on first use
  std::vector<const void*> highAddresses;  // beyond 48 bits: a plain list
  // Globs come and go near one another: the leaf found last answers most lookups. Leaves are
  // never given back, so the remembered one stays valid.
  uintptr_t lastLeafKey = ~uintptr_t{0};
  Leaf* lastLeaf = nullptr;
};

// Made once and kept to the end of the process: Globs may outlive static destruction.
State& state() {
  static State* s = new State;
  return *s;
}

bool isHigh(uintptr_t a) {
  return (a >> (kLeafShift + 2 * kNodeBits)) != 0;
}

// The word and bit of an address; null when its leaf was never made (and `make` is false).
uint64_t* wordOf(uintptr_t a, uint64_t& mask, bool make) {
  State& s = state();
  const size_t granule = (a & ((uintptr_t{1} << kLeafShift) - 1)) >> kGranuleShift;
  mask = uint64_t{1} << (granule % 64);
  if ((a >> kLeafShift) == s.lastLeafKey) return &s.lastLeaf->bits[granule / 64];
  if (!s.nodes) {
    if (!make) return nullptr;
    s.nodes = static_cast<Node**>(std::calloc(size_t{1} << kNodeBits, sizeof(Node*)));
  }
  const size_t top = a >> (kLeafShift + kNodeBits);
  const size_t mid = (a >> kLeafShift) & ((size_t{1} << kNodeBits) - 1);
  Node*& node = s.nodes[top];
  if (!node) {
    if (!make) return nullptr;
    node = static_cast<Node*>(std::calloc(1, sizeof(Node)));
  }
  Leaf*& leaf = node->leaves[mid];
  if (!leaf) {
    if (!make) return nullptr;
    leaf = static_cast<Leaf*>(std::calloc(1, sizeof(Leaf)));
  }
  s.lastLeafKey = a >> kLeafShift;
  s.lastLeaf = leaf;
  return &leaf->bits[granule / 64];
}

void markAddress(const void* p, bool live) {
  const auto a = reinterpret_cast<uintptr_t>(p);
  State& s = state();
  if (isHigh(a)) {
    auto& list = s.highAddresses;
    if (live) {
      list.push_back(p);
    } else if (auto it = std::find(list.begin(), list.end(), p); it != list.end()) {
      list.erase(it);
    }
    return;
  }
  uint64_t mask = 0;
  uint64_t* word = wordOf(a, mask, live);
  if (!word) return;
  if (live) {
    *word |= mask;
  } else {
    *word &= ~mask;
  }
}

}  // namespace

uint64_t GlobRegistry::enter(const Glob* g) {
  State& s = state();
  uint32_t slot;
  if (!s.freeSlots.empty()) {
    slot = s.freeSlots.back();
    s.freeSlots.pop_back();
  } else {
    slot = static_cast<uint32_t>(s.slots.size());
    s.slots.push_back(1);  // generation 0 is never handed out, so no identity is ever 0
  }
  ++s.live;
  markAddress(g, true);
  return (uint64_t{s.slots[slot]} << 32) | slot;
}

void GlobRegistry::leave(const Glob* g, uint64_t identity) {
  if (!isLive(g, identity)) return;
  State& s = state();
  const auto slot = static_cast<uint32_t>(identity);
  Slot& generation = s.slots[slot];
  if (++generation == 0) generation = 1;
  s.freeSlots.push_back(slot);
  --s.live;
  markAddress(g, false);
}

bool GlobRegistry::isLive(const Glob* g, uint64_t identity) {
  const State& s = state();
  const auto slot = static_cast<uint32_t>(identity);
  return g && slot < s.slots.size() && s.slots[slot] == static_cast<uint32_t>(identity >> 32);
}

bool GlobRegistry::isLiveAddress(const void* p) {
  const auto a = reinterpret_cast<uintptr_t>(p);
  if (!p || (a & ((uintptr_t{1} << kGranuleShift) - 1)) != 0) return false;
  if (isHigh(a)) {
    const auto& list = state().highAddresses;
    return std::find(list.begin(), list.end(), p) != list.end();
  }
  uint64_t mask = 0;
  const uint64_t* word = wordOf(a, mask, false);
  return word && (*word & mask) != 0;
}

uint32_t GlobRegistry::liveCount() {
  return state().live;
}
