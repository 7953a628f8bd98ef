#pragma once
// What the check-box page keeps alive beside its controls: the model value several controls
// show, the pair of boxes coupled to it, the managed row, and the wiring that turns a
// tri-state "all" box and its members into one choice. It is an invisible child of the page,
// so it goes when the page goes; every control it points at is held by handle.
#include "buttons/BoolRadioSet.h"
#include "buttons/CheckboxRadioSetManager.h"
#include "buttons/TriStateBox.h"
#include "foundation/ValServerAdaptor.h"
#include "platform/glob/Glob.h"

class ChecksPageModel : public Glob {
 public:
  explicit ChecksPageModel(Canvas* page);

  ValServer<bool>& loop() { return loop_; }
  // Binds a box to the shared value.
  void bind(Checkbox* box);
  BoolRadioSet& loopPair() { return loopPair_; }
  CheckboxRadioSetManager& quality() { return quality_; }
  // The "all" box stands for its members: ticked when all are, clear when none are, mixed
  // otherwise; clicking it sets every member alike.
  void setAllBox(TriStateBox* all, Checkbox* first, Checkbox* second);

  const char* idstring() const override { return "checkspagemodel"; }

 private:
  static void allClicked(Checkbox* box, void* model);
  static void memberClicked(Checkbox* box, void* model);
  void showMembersInAllBox();

  ValServer<bool> loop_{false};
  Kw::Ptr<ValServerAdaptor<bool>> loopAdaptor_;
  BoolRadioSet loopPair_;
  CheckboxRadioSetManager quality_;
  GlobHandle<TriStateBox> all_;
  GlobHandle<Checkbox> members_[2];
};
