#include "dropdowns/DropDownChoices.h"

#include <algorithm>
#include <climits>
#include <cstring>

String DropDownChoices::selectMessage(int n) {
  return kSelectPrefix + std::to_string(n);
}

int DropDownChoices::numberFromMessage(const String& msg) {
  const size_t prefix = std::strlen(kSelectPrefix);
  if (msg.size() <= prefix || msg.compare(0, prefix, kSelectPrefix) != 0) return -1;
  long long n = 0;
  for (size_t i = prefix; i < msg.size(); ++i) {
    const char c = msg[i];
    if (c < '0' || c > '9') return -1;
    n = n * 10 + (c - '0');
    if (n > INT_MAX) return -1;
  }
  return static_cast<int>(n);
}

int DropDownChoices::indexFromMessage(const String& msg, size_t count) {
  const int n = numberFromMessage(msg);
  return n >= 0 && static_cast<size_t>(n) < count ? n : -1;
}

bool DropDownChoices::isChoosable(const std::vector<MenuItem>& items, int i) {
  if (i < 0 || static_cast<size_t>(i) >= items.size()) return false;
  const MenuItem& it = items[i];
  return !it.isGroupHeader() && it.type() != IconicMenuItem && it.getActive() &&
         !it.getDisplayString().empty();
}

bool DropDownChoices::isSteppable(const std::vector<MenuItem>& items, int i) {
  return isChoosable(items, i) && (items[i].getFlags() & kNoStepFlag) == 0 &&
         !items[i].msg().empty();
}

int DropDownChoices::step(const std::vector<MenuItem>& items, int selected, int delta) {
  const int n = static_cast<int>(items.size());
  if (delta > 0) {
    for (int i = std::min(selected, n) - 1; i >= 0; --i) {
      if (isSteppable(items, i)) return i;
    }
  } else {
    for (int i = std::max(selected, -1) + 1; i < n; ++i) {
      if (isSteppable(items, i)) return i;
    }
  }
  return -1;
}

std::vector<MenuItem> DropDownChoices::itemsFromStrings(const std::vector<WString>& texts) {
  std::vector<MenuItem> items;
  items.reserve(texts.size());
  for (size_t i = 0; i < texts.size(); ++i) {
    items.emplace_back(texts[i], selectMessage(static_cast<int>(i)));
  }
  return items;
}

void DropDownChoices::fillSelectMessages(std::vector<MenuItem>& items) {
  for (size_t i = 0; i < items.size(); ++i) {
    if (items[i].msg().empty() && !items[i].isGroupHeader()) {
      items[i].msg(selectMessage(static_cast<int>(i)));
    }
  }
}
