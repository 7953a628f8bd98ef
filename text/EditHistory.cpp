#include "text/EditHistory.h"

#include <utility>

void EditHistory::record(Item item) {
  undo_.push_back(std::move(item));
  redo_.clear();
  trim();
}

void EditHistory::clear() {
  undo_.clear();
  redo_.clear();
}

void EditHistory::trim() {
  while (undo_.size() > kDepth) undo_.pop_front();
}

bool EditHistory::joinsWord(wchar_t older, wchar_t newer) {
  if (older == L'\n' || newer == L'\n') return false;
  return (older == L' ') == (newer == L' ');
}

bool EditHistory::undo(const GroupAction& revert) {
  if (undo_.empty()) return false;
  std::size_t count = 1;
  const Item& newest = undo_.back();
  if (newest.isTyping()) {
    // Merge backwards while the older items are typing of the same kind.
    while (count < undo_.size()) {
      const Item& older = undo_[undo_.size() - 1 - count];
      const Item& newer = undo_[undo_.size() - count];
      if (!older.isTyping() || !joinsWord(older.inserted[0], newer.inserted[0])) break;
      ++count;
    }
  }
  Group group;
  group.reserve(count);
  for (std::size_t i = 0; i < count; ++i) {
    group.push_back(std::move(undo_.back()));
    undo_.pop_back();
  }
  revert(group);
  redo_.push_back(std::move(group));
  return true;
}

bool EditHistory::redo(const GroupAction& replay) {
  if (redo_.empty()) return false;
  Group group = std::move(redo_.back());
  redo_.pop_back();
  replay(group);
  for (auto it = group.rbegin(); it != group.rend(); ++it) undo_.push_back(std::move(*it));
  trim();
  return true;
}
