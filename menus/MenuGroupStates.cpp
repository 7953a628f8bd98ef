// A menu's group states kept in the user preferences, one entry per group header under
// "Menu (" + key + ") : " + header.
#include "menus/Menu.h"
#include "platform/misc/EditorPreferences.h"

String Menu::groupPreferenceName(const String& key, const WString& header) {
  return "Menu (" + key + ") : " + Kw::toUtf8(header);
}

void Menu::saveGroupStates(const String& key) const {
  if (key.empty()) return;
  for (const MenuItem& it : items_) {
    if (!it.isGroupHeader()) continue;
    prefs().setPreference(groupPreferenceName(key, it.getDisplayString()),
                          menuItemTypeName(it.type()));
  }
}

void Menu::restoreGroupStates(const String& key) {
  if (key.empty()) return;
  for (MenuItem& it : items_) {
    if (!it.isGroupHeader()) continue;
    const String name = groupPreferenceName(key, it.getDisplayString());
    if (!prefs().hasPreference(name)) continue;
    MenuItemType t = it.type();
    // Only a header state is taken: a stored value naming anything else leaves the header.
    if (menuItemTypeFromName(prefs().getPreference(name), t) &&
        (t == ExpandedGroupItem || t == CompressedGroupItem)) {
      it.type(t);
    }
  }
  ensureAtLeastOneExpandedGroup();
  rebuild();
}

void Menu::ensureAtLeastOneExpandedGroup() {
  int lastCompressed = -1;
  for (size_t i = 0; i < items_.size(); ++i) {
    if (items_[i].type() == ExpandedGroupItem) return;
    if (items_[i].type() == CompressedGroupItem) lastCompressed = static_cast<int>(i);
  }
  if (lastCompressed >= 0) items_[lastCompressed].type(ExpandedGroupItem);
}
