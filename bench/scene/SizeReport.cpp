// The size of every control class and of the pieces each Glob carries.
#include <cstdio>
#include <string>

#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"
#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "buttons/CheckboxRadioSet.h"
#include "buttons/ImageButton.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/RadioSet.h"
#include "buttons/RadioSetCheckbox.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "buttons/TriStateBox.h"
#include "foundation/rect.h"
#include "panels/ModalShade.h"
#include "panels/StandardPanel.h"
#include "platform/glob/Canvas.h"
#include "platform/glob/Glob.h"
#include "platform/glob/Palette.h"
#include "platform/glob/RootGlob.h"
#include "text/PanelTitleTextBox.h"
#include "text/TextBox.h"
#include "text/TextCursor.h"

namespace scene {

namespace {

struct Size {
  const char* name;
  size_t bytes;
};

template <typename T>
Size sizeOf(const char* name) {
  return Size{name, sizeof(T)};
}

}  // namespace

void reportSizes(bool asNotes) {
  const Size sizes[] = {
      sizeOf<Glob>("Glob"),
      sizeOf<Canvas>("Canvas"),
      sizeOf<Palette>("Palette"),
      sizeOf<MenuGlob>("MenuGlob"),
      sizeOf<rect>("rect"),
      sizeOf<StandardPanel>("StandardPanel"),
      sizeOf<Button>("Button"),
      sizeOf<ImageButton>("ImageButton"),
      sizeOf<PinButton>("PinButton"),
      sizeOf<PootButton>("PootButton"),
      sizeOf<SizeButton>("SizeButton"),
      sizeOf<SettingsButton>("SettingsButton"),
      sizeOf<RadioSet>("RadioSet"),
      sizeOf<Checkbox>("Checkbox"),
      sizeOf<TriStateBox>("TriStateBox"),
      sizeOf<RadioSetCheckbox>("RadioSetCheckbox"),
      sizeOf<CheckboxRadioSet>("CheckboxRadioSet"),
      sizeOf<TextBoxBase>("TextBoxBase"),
      sizeOf<TextBox>("TextBox"),
      sizeOf<PanelTitleTextBox>("PanelTitleTextBox"),
      sizeOf<TextCursor>("TextCursor"),
      sizeOf<ModalShade>("ModalShade"),
      sizeOf<RootGlob>("RootGlob"),
  };
  for (const Size& s : sizes) {
    if (asNotes) {
      note("sizeof " + std::string(s.name) + " " + std::to_string(s.bytes));
    } else {
      std::printf("%-20s %6zu\n", s.name, s.bytes);
    }
  }
}

}  // namespace scene
