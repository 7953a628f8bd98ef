#include "buttons/CheckboxRadioSetManager.h"

CheckboxRadioSetManager::~CheckboxRadioSetManager() {
  for (const GlobHandle<RadioSetCheckbox>& m : members_) {
    RadioSetCheckbox* box = m.get();
    if (box && box->getUserData() == this) box->setUserFunction(nullptr, nullptr);
  }
}

void CheckboxRadioSetManager::add(RadioSetCheckbox* box) {
  if (!box) return;
  for (const GlobHandle<RadioSetCheckbox>& m : members_)
    if (m.get() == box) return;
  box->setUserFunction(&CheckboxRadioSetManager::callback, this);
  members_.emplace_back(box);
}

uint16_t CheckboxRadioSetManager::getSelected() const {
  for (size_t i = 0; i < members_.size(); ++i) {
    const RadioSetCheckbox* box = members_[i].get();
    if (box && box->getState()) return static_cast<uint16_t>(i);
  }
  return 0;
}

void CheckboxRadioSetManager::callback(Checkbox* box, void* manager) {
  static_cast<CheckboxRadioSetManager*>(manager)->callback(box);
}

void CheckboxRadioSetManager::callback(Checkbox* box) {
  refresh_off();
  GlobHandle<Checkbox> clicked(box);
  // A member's model may delete the row, and this manager with it: walk a copy of the list.
  const std::vector<GlobHandle<RadioSetCheckbox>> members = members_;
  box->setState(true);
  for (const GlobHandle<RadioSetCheckbox>& m : members) {
    RadioSetCheckbox* other = m.get();
    if (other && static_cast<Checkbox*>(other) != box) other->setState(false);
  }
  // The receiver may delete the row, and this manager with it: nothing is touched afterwards.
  if (Checkbox* b = clicked.get()) b->sendToggleMessage(false);
  refresh_on();
}
