#pragma once
// The engine of a one-of-many choice: up to 1024 members (buttons or check boxes) in order of
// addition, and the index of the selected one. It only switches members up and down; laying
// them out and reporting the choice belong to the control that holds it.
//
// Choices made here:
// - Members are held through GlobHandle: a member deleted behind the set's back is skipped by
//   every operation (its slot and index stay, so later members keep their numbers), and the
//   set can still be destroyed safely.
// - A member with a switch_state operation (a Button) is switched with it, `flag` being its
//   `silent` argument. A check box is switched with its setState(bool); it reports only user
//   toggles, so `flag` makes no difference to it.
// - A member's report may lead its receiver to delete the set: set_current stops touching the
//   set as soon as that happens.
// - A null member is refused (-1) like a 1025th one, but without the diagnostic.
#include <array>
#include <cstdint>
#include <memory>

#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"

template <typename M>
concept SwitchableRadioMember = requires(M* m, bool silent) {
  m->switch_state(m->get_state(), silent);
};

template <typename T>
class RadioSetBase {
 public:
  static constexpr uint16_t kMaxButtons = 1024;
  static constexpr const char* kTooManyDiagnostic =
      "RadioSetBase:: attempt to exceed max no of radio buttons";

  RadioSetBase() = default;
  RadioSetBase(const RadioSetBase&) = delete;
  RadioSetBase& operator=(const RadioSetBase&) = delete;
  virtual ~RadioSetBase() { *alive_ = false; }

  // Selects member `index`: the previous one goes up, the new one down. Nothing happens when
  // `index` is the current one, negative, or not below count.
  virtual void set_current(int index, bool flag) {
    if (index == current || index < 0 || index >= static_cast<int>(count)) return;
    const std::shared_ptr<bool> alive = alive_;
    const int previous = current;
    if (previous >= 0 && previous < static_cast<int>(count)) {
      if (T* b = buttons[previous].get()) switchMember(b, false, flag);
      if (!*alive) return;
    }
    current = index;
    if (T* b = buttons[index].get()) switchMember(b, true, flag);
  }

  // Appends `b`; returns its index, or -1 when the set is full (with a diagnostic).
  int add_button(T* b) {
    if (count >= kMaxButtons) {
      Diagnostics::print(DiagLevel::Warning, kTooManyDiagnostic);
      return -1;
    }
    if (!b) return -1;
    buttons[count] = GlobHandle<T>(b);
    return count++;
  }

  // Selects `b` if it is a member; anything else is ignored.
  void setCurrent(T* b, bool flag) {
    const int i = indexOf(b);
    if (i >= 0) set_current(i, flag);
  }

  int getCurrentButton() const { return current; }
  uint16_t buttonCount() const { return count; }
  // The member at `index`, or null when there is none or it has been deleted.
  T* buttonAt(int index) const {
    return index >= 0 && index < static_cast<int>(count) ? buttons[index].get() : nullptr;
  }
  // The index of a live member, or -1. `b` may dangle: it is compared, never read.
  int indexOf(const T* b) const {
    if (!b) return -1;
    for (int i = 0; i < static_cast<int>(count); ++i)
      if (buttons[i].get() == b) return i;
    return -1;
  }

 protected:
  std::array<GlobHandle<T>, kMaxButtons> buttons{};
  uint16_t count = 0;
  int current = -1;

 private:
  static void switchMember(T* b, bool down, bool flag) {
    if constexpr (SwitchableRadioMember<T>) {
      using State = decltype(b->get_state());
      b->switch_state(static_cast<State>(down ? 1 : 0), flag);
    } else {
      b->setState(down);
    }
  }

  std::shared_ptr<bool> alive_ = std::make_shared<bool>(true);
};
