#pragma once
// The key codes controls compare against: control characters in the low bits, and the keys
// with no character as their PC scan code with kKeyScanCode set (Event.h has the modifier bits).
#include "platform/glob/Event.h"

constexpr unsigned kKeyBackspace = 8;
constexpr unsigned kKeyTab = 9;
constexpr unsigned kKeyReturn = 13;
constexpr unsigned kKeyEscape = 27;
constexpr unsigned kKeySpace = 32;

// PC scan codes of the keys that have no character.
constexpr unsigned kScanHome = 0x47;
constexpr unsigned kScanUp = 0x48;
constexpr unsigned kScanPageUp = 0x49;
constexpr unsigned kScanLeft = 0x4B;
constexpr unsigned kScanRight = 0x4D;
constexpr unsigned kScanEnd = 0x4F;
constexpr unsigned kScanDown = 0x50;
constexpr unsigned kScanPageDown = 0x51;
constexpr unsigned kScanInsert = 0x52;
constexpr unsigned kScanDelete = 0x53;

// The same keys as they arrive in key events.
constexpr unsigned kKeyHome = kKeyScanCode | kScanHome;
constexpr unsigned kKeyUp = kKeyScanCode | kScanUp;
constexpr unsigned kKeyPageUp = kKeyScanCode | kScanPageUp;
constexpr unsigned kKeyLeft = kKeyScanCode | kScanLeft;
constexpr unsigned kKeyRight = kKeyScanCode | kScanRight;
constexpr unsigned kKeyEnd = kKeyScanCode | kScanEnd;
constexpr unsigned kKeyDown = kKeyScanCode | kScanDown;
constexpr unsigned kKeyPageDown = kKeyScanCode | kScanPageDown;
constexpr unsigned kKeyInsert = kKeyScanCode | kScanInsert;
constexpr unsigned kKeyDelete = kKeyScanCode | kScanDelete;

// The largest character a key code can carry in its low bits.
constexpr unsigned kKeyCharacterMask = 0x00FFFFFF;

// The character a key press types: a printable character with no modifier but Shift. 0 for
// every other key (shortcuts with Ctrl or Alt, scan-code keys, control characters), so that
// every control that takes typing decides the same way.
wchar_t typedCharacter(unsigned keyCode);
