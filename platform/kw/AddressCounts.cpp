#include "platform/kw/AddressCounts.h"

namespace Kw {

namespace {
constexpr std::size_t kFirstSize = 16;
}  // namespace

std::size_t AddressCounts::home(const void* address) const {
  // Heap addresses share their low bits: mix them all before taking the table's share.
  std::uint64_t h = reinterpret_cast<std::uintptr_t>(address);
  h ^= h >> 33;
  h *= 0xff51afd7ed558ccdULL;
  h ^= h >> 33;
  return static_cast<std::size_t>(h) & (slots_.size() - 1);
}

std::size_t AddressCounts::find(const void* address) const {
  const std::size_t mask = slots_.size() - 1;
  std::size_t i = home(address);
  while (slots_[i].address && slots_[i].address != address) i = (i + 1) & mask;
  return i;
}

void AddressCounts::grow() {
  std::vector<Slot> old;
  old.swap(slots_);
  slots_.resize(old.empty() ? kFirstSize : old.size() * 2);
  for (const Slot& s : old) {
    if (s.address) slots_[find(s.address)] = s;
  }
}

void AddressCounts::add(const void* address) {
  if (!address) return;
  if ((used_ + 1) * 2 > slots_.size()) grow();
  Slot& s = slots_[find(address)];
  if (!s.address) {
    s.address = address;
    ++used_;
  }
  ++s.count;
}

bool AddressCounts::contains(const void* address) const {
  return count(address) != 0;
}

unsigned AddressCounts::count(const void* address) const {
  if (!address || slots_.empty()) return 0;
  return slots_[find(address)].count;
}

bool AddressCounts::remove(const void* address) {
  if (!address || slots_.empty()) return false;
  std::size_t hole = find(address);
  Slot& s = slots_[hole];
  if (!s.address) return false;
  if (--s.count > 0) return true;
  // Close the gap: pull back each later entry of the run that may not stay past the hole.
  const std::size_t mask = slots_.size() - 1;
  for (std::size_t j = (hole + 1) & mask; slots_[j].address; j = (j + 1) & mask) {
    const std::size_t want = home(slots_[j].address);
    // Entry j may stay when its home lies cyclically in (hole, j].
    const bool stays = hole < j ? (want > hole && want <= j) : (want > hole || want <= j);
    if (!stays) {
      slots_[hole] = slots_[j];
      hole = j;
    }
  }
  slots_[hole] = Slot{};
  --used_;
  return true;
}

void AddressCounts::clear() {
  std::vector<Slot>().swap(slots_);
  used_ = 0;
}

}  // namespace Kw
