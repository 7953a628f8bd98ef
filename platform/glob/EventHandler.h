#pragma once
// Something events can be handed to directly, outside the tree's routing: filters see an event
// first and may keep it; handleEvent takes it.
class Event;

// The result of an event or message handler: 1 when it consumed the event, anything else lets
// handling go on. Kept an int so handlers can pass on a react result unchanged.
using EventHandlerRc = int;

constexpr EventHandlerRc kEventNotConsumed = 0;
constexpr EventHandlerRc kEventConsumed = 1;

class EventHandler {
 public:
  // True when this handler keeps `e` from going on; `context` is what the filter was installed
  // with. The base lets everything through.
  virtual bool fsFilterThis(Event* e, void* context) { return false; }
  virtual ~EventHandler() = default;
  virtual EventHandlerRc handleEvent(Event* e) { return kEventNotConsumed; }
};
