#pragma once
// The result of an event or message handler: 1 when it consumed the event, anything else lets
// handling go on. Kept an int so handlers can pass on a react result unchanged.
using EventHandlerRc = int;

constexpr EventHandlerRc kEventNotConsumed = 0;
constexpr EventHandlerRc kEventConsumed = 1;
