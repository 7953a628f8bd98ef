#include "text/EditHistory.h"

#include <utility>

EditHistory::Lists& EditHistory::lists() {
  if (!lists_) lists_ = std::make_unique<Lists>();
  return *lists_;
}

void EditHistory::record(Item item) {
  Lists& l = lists();
  l.undo.push_back(std::move(item));
  l.redo.clear();
  trim();
}

void EditHistory::clear() {
  lists_.reset();
}

void EditHistory::trim() {
  std::deque<Item>& undo = lists_->undo;
  while (undo.size() > kDepth) undo.pop_front();
}

bool EditHistory::joinsWord(wchar_t older, wchar_t newer) {
  if (older == L'\n' || newer == L'\n') return false;
  return (older == L' ') == (newer == L' ');
}

bool EditHistory::undo(const GroupAction& revert) {
  if (!canUndo()) return false;
  std::deque<Item>& undo = lists_->undo;
  std::size_t count = 1;
  const Item& newest = undo.back();
  if (newest.isTyping()) {
    // Merge backwards while the older items are typing of the same kind.
    while (count < undo.size()) {
      const Item& older = undo[undo.size() - 1 - count];
      const Item& newer = undo[undo.size() - count];
      if (!older.isTyping() || !joinsWord(older.inserted[0], newer.inserted[0])) break;
      ++count;
    }
  }
  Group group;
  group.reserve(count);
  for (std::size_t i = 0; i < count; ++i) {
    group.push_back(std::move(undo.back()));
    undo.pop_back();
  }
  revert(group);
  // The action may have cleared the history.
  lists().redo.push_back(std::move(group));
  return true;
}

bool EditHistory::redo(const GroupAction& replay) {
  if (!canRedo()) return false;
  Group group = std::move(lists_->redo.back());
  lists_->redo.pop_back();
  replay(group);
  std::deque<Item>& undo = lists().undo;
  for (auto it = group.rbegin(); it != group.rend(); ++it) undo.push_back(std::move(*it));
  trim();
  return true;
}
