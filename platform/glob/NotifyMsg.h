#pragma once
// A notification handed to Glob::notify, destroy and bufNotify: what happened, who says so and
// an optional text.
#include "platform/kw/String.h"

class Glob;

struct NotifyMsg {
  enum Kind : int {
    Changed = 0,    // something the receiver shows has changed
    Deleting = 1,   // the sender is going away
    Moved = 2,      // the sender moved or changed size
    BufferEdit = 3  // the text buffer the receiver shows was edited
  };
  Kind kind = Changed;
  Glob* from = nullptr;
  String text;
};
