#include "platform/glob/KeyCodes.h"

#include "platform/kw/CharClassifier.h"

wchar_t typedCharacter(unsigned keyCode) {
  if ((keyCode & ~kKeyShift & ~kKeyCharacterMask) != 0) return 0;
  const auto ch = static_cast<wchar_t>(keyCode & kKeyCharacterMask);
  return CharClassifier::isPrintable(ch) ? ch : 0;
}
