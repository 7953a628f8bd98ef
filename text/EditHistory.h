#pragma once
// The undo and redo lists of a text editor.
//
// Each edit is one small record: where it happened, the text it removed and the text it
// inserted, and the caret and selection around it. Typing records one item per character;
// undo merges them into words when it takes them back (see `takeUndoGroup`), so a redo list
// entry is a group of items that is replayed as one.
//
// Depth: the undo list keeps the newest `kDepth` items and forgets the oldest beyond that
// (a typed character is one item, so this is several hundred words of typing). The redo list
// only ever holds what was undone, so it is bounded by the same count. Recording a new edit
// clears the redo list.
#include <cstddef>
#include <deque>
#include <functional>
#include <memory>
#include <span>
#include <vector>

#include "platform/kw/String.h"

class EditHistory {
 public:
  struct Item {
    int position = 0;  // where `removed` stood and `inserted` now stands
    WString removed;
    WString inserted;
    int caretBefore = 0;
    int selectionStartBefore = -1;  // -1: no selection before the edit
    int selectionEndBefore = -1;
    int caretAfter = 0;

    // One typed character that replaced nothing: the only kind undo merges.
    bool isTyping() const { return removed.empty() && inserted.size() == 1; }
  };

  // Items newest first, as undo reverts them.
  using Group = std::vector<Item>;
  using GroupAction = std::function<void(std::span<const Item>)>;

  static constexpr std::size_t kDepth = 1000;

  // Appends an edit and clears the redo list.
  void record(Item item);
  void clear();

  bool canUndo() const { return lists_ && !lists_->undo.empty(); }
  bool canRedo() const { return lists_ && !lists_->redo.empty(); }
  std::size_t undoCount() const { return lists_ ? lists_->undo.size() : 0; }

  // Hands the newest group of undo items (newest first) to `revert` and moves it to the redo
  // list. A group is the newest item alone, unless it is typing: then older typing joins it
  // until an item that is not typing, or a word boundary (a space joins only spaces, anything
  // else only non-spaces, and a newline always stands alone). False when there is nothing.
  bool undo(const GroupAction& revert);

  // Hands the newest redo group (newest first) to `replay` and returns its items to the undo
  // list, where a later undo groups them the same way again. False when there is nothing.
  bool redo(const GroupAction& replay);

  // True when typing `newer` may be merged with the older typed `older`.
  static bool joinsWord(wchar_t older, wchar_t newer);

 private:
  struct Lists {
    std::deque<Item> undo;
    std::vector<Group> redo;
  };
  Lists& lists();
  void trim();

  // Made at the first edit: a box that is only shown, never edited, keeps no lists.
  std::unique_ptr<Lists> lists_;
};
