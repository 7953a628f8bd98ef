#pragma once
// The standard widgets of a standard panel: the close, settings, size and pin buttons and the
// title box in the title strip, and the do-it button in the bottom strip. It holds the
// standard-widget flags, makes each widget while its flag is set (again, if it was deleted
// behind the panel's back) and deletes it when the flag goes, lays them all out in the
// panel's strips, and keeps the size and pin buttons showing the panel's state.
//
// The widgets are child Globs of the panel, which deletes them with itself; this object only
// keeps handles to them, so every use checks that the widget is still alive.
#include "panels/PanelLayoutTypes.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/String.h"

class Button;
class Glob;
class PanelTitleTextBox;
class PinButton;
class PootButton;
class SettingsButton;
class SizeButton;
class StandardPanel;

class PanelStandardWidgets {
 public:
  explicit PanelStandardWidgets(StandardPanel& panel);
  ~PanelStandardWidgets();
  PanelStandardWidgets(const PanelStandardWidgets&) = delete;
  PanelStandardWidgets& operator=(const PanelStandardWidgets&) = delete;

  int flags() const { return flags_; }
  // ORs `flags` in and makes every widget whose flag is set and that is missing.
  void add(int flags);
  // Clears `flags` and deletes their widgets; false when none of them was set.
  bool remove(int flags);
  // Places every widget in the panel's strips as the panel is now.
  void position();

  // The left edge of `panel`'s title buttons (less the gap), or the right end of the strip;
  // `widgets` is the panel's record, null when it has none.
  static int titleButtonsLeft(const StandardPanel& panel, const PanelStandardWidgets* widgets);
  // The width left for the title box between the left border and the title buttons.
  static int maxTitleWidth(const StandardPanel& panel, const PanelStandardWidgets* widgets);

  Glob* widget(StandardWidgetFlag flag) const;
  PanelTitleTextBox* titleBox() const;
  Glob* titleBoxGlob() const;
  Button* doIt() const;
  PinButton* pin() const;
  // Shows the panel's title in the title box, if there is one.
  void showTitle(const WString& title);
  // The size button shows the panel's size state, the pin button its pin state.
  void syncSizeButton();
  void syncPinButton();

 private:
  void createButtons();
  // Makes, re-styles or deletes the title box to match the title flags.
  void syncTitleBox();
  bool onPanel(const Glob* g) const;

  StandardPanel& panel_;
  int flags_ = 0;
  GlobHandle<PootButton> poot_;
  GlobHandle<SettingsButton> settings_;
  GlobHandle<SizeButton> size_;
  GlobHandle<PinButton> pin_;
  GlobHandle<Button> doIt_;
  GlobHandle<PanelTitleTextBox> title_;
};
