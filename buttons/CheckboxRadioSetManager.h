#pragma once
// Turns a row of RadioSetCheckbox members into a one-of-many choice. Each member's user
// function becomes the manager's callback: a click ticks that member, clears the others and
// reports the member's bare message prefix (no state word) to its parent.
//
// Choices made here:
// - Members are held through GlobHandle: one deleted behind the manager's back is skipped
//   (getSelected still counts its place, so indices match the order of addition).
// - A manager destroyed before its members takes its callback off the live ones.
// - Adding a null member, or one already present, is ignored.
#include <cstdint>
#include <vector>

#include "buttons/RadioSetCheckbox.h"
#include "platform/glob/GlobHandle.h"

class CheckboxRadioSetManager {
 public:
  CheckboxRadioSetManager() = default;
  CheckboxRadioSetManager(const CheckboxRadioSetManager&) = delete;
  CheckboxRadioSetManager& operator=(const CheckboxRadioSetManager&) = delete;
  ~CheckboxRadioSetManager();

  void add(RadioSetCheckbox* box);
  // The index of the first ticked member; 0 when none is ticked or there are none.
  uint16_t getSelected() const;
  size_t size() const { return members_.size(); }

 private:
  void callback(Checkbox* box);
  static void callback(Checkbox* box, void* manager);

  std::vector<GlobHandle<RadioSetCheckbox>> members_;
};
