#pragma once
// Which Globs are alive, answered without hashing. Every live Glob holds a slot of a table;
// when it goes, the slot's generation moves on, so the pair (generation, slot) names one Glob
// for the whole run and tells it from a newer Glob at the same address. Bare addresses, which
// may dangle, are answered by a map of the address space with one bit per 8 bytes, kept in
// leaves of 64 KB made as Globs appear there and never given back.
//
// Everything runs on the GUI thread: the registry takes no locks.
#include <cstdint>

class Glob;

class GlobRegistry {
 public:
  // Enters a Glob being constructed; returns its identity, never 0.
  static uint64_t enter(const Glob* g);
  // Forgets the Glob of that identity (from its destructor).
  static void leave(const Glob* g, uint64_t identity);
  // Whether the Glob that was given `identity` is still alive; `g` must be that Glob (handles
  // keep the two together), and a null `g` is never alive.
  static bool isLive(const Glob* g, uint64_t identity);
  // Whether a live Glob has the address `p`.
  static bool isLiveAddress(const void* p);
  // How many Globs are alive.
  static uint32_t liveCount();
};
