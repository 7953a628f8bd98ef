#pragma once
// dynamic_cast between the bases of one object, remembered per kind of object.
//
// A cast from a Glob to a sibling base (its tab stop, say) walks the whole class hierarchy and
// compares type names on the way; a panel adopting a thousand controls of four kinds would do
// that walk a thousand times. For one most-derived type, and one place of the source within
// it, the answer is always the same displacement (or always "no such base"), so it is worked
// out once and kept in a small per-thread table keyed by both.
#include <cstddef>
#include <typeinfo>

namespace Kw {

template <class To, class From>
To* crossCast(From* from) {
  if (!from) return nullptr;
  struct Entry {
    const std::type_info* type = nullptr;
    std::ptrdiff_t fromOffset = 0;  // the source's place in the whole object
    std::ptrdiff_t toOffset = 0;    // the target's, or -1 when there is none
  };
  constexpr unsigned kEntries = 8;
  thread_local Entry cache[kEntries];
  thread_local unsigned next = 0;

  // Worked in bytes of the whole object; constness is the caller's and stays in To.
  auto* whole = const_cast<char*>(static_cast<const char*>(dynamic_cast<const void*>(from)));
  const std::ptrdiff_t fromOffset = reinterpret_cast<const char*>(from) - whole;
  const std::type_info* type = &typeid(*from);
  for (const Entry& e : cache) {
    if (e.type == type && e.fromOffset == fromOffset) {
      return e.toOffset < 0 ? nullptr : reinterpret_cast<To*>(whole + e.toOffset);
    }
  }
  To* to = dynamic_cast<To*>(from);
  cache[next++ % kEntries] =
      Entry{type, fromOffset, to ? reinterpret_cast<const char*>(to) - whole : -1};
  return to;
}

}  // namespace Kw
