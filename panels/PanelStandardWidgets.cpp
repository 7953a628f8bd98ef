#include "panels/PanelStandardWidgets.h"

#include <algorithm>

#include "buttons/Button.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "panels/StandardPanel.h"
#include "platform/misc/UIString.h"
#include "text/PanelTitleTextBox.h"

namespace {

constexpr unsigned short kTitleButtonSize = 20;
constexpr unsigned short kPinWidth = 16;
constexpr unsigned short kPinHeight = 20;
constexpr unsigned short kTitleBoxHeight = 20;
constexpr unsigned short kDoItWidth = 80;
constexpr unsigned short kDoItHeight = 22;
constexpr unsigned kDoItLabelId = 41;

constexpr int kTitleMargin = PanelGeometry::kTitleMargin;
constexpr int kTitleGap = PanelGeometry::kTitleGap;

}  // namespace

PanelStandardWidgets::PanelStandardWidgets(StandardPanel& panel) : panel_(panel) {}

// The widgets are the panel's children: they go with the panel, not with this object.
PanelStandardWidgets::~PanelStandardWidgets() = default;

PanelTitleTextBox* PanelStandardWidgets::titleBox() const {
  return title_.get();
}

Button* PanelStandardWidgets::doIt() const {
  return doIt_.get();
}

PinButton* PanelStandardWidgets::pin() const {
  return pin_.get();
}

bool PanelStandardWidgets::onPanel(const Glob* g) const {
  return g->canvas()->parent() == panel_.canvas();
}

Glob* PanelStandardWidgets::titleBoxGlob() const {
  return title_.get();
}

Glob* PanelStandardWidgets::widget(StandardWidgetFlag flag) const {
  switch (flag) {
    case StdPootButton:
      return poot_.get();
    case StdSettingsButton:
      return settings_.get();
    case StdSizeButton:
      return size_.get();
    case StdDoItButton:
      return doIt_.get();
    case StdPinButton:
      return pin_.get();
    case StdTitleBox:
    case StdEditableTitleBox:
      return titleBoxGlob();
  }
  return nullptr;
}

void PanelStandardWidgets::add(int flags) {
  flags_ |= flags & kStdAllFlags;
  createButtons();
  syncTitleBox();
}

bool PanelStandardWidgets::remove(int flags) {
  flags &= flags_;
  if (!flags) return false;
  flags_ &= ~flags;
  auto drop = [](auto& h) {
    if (Glob* g = h.get()) delete g;
    h.reset();
  };
  if (flags & StdPootButton) drop(poot_);
  if (flags & StdSettingsButton) drop(settings_);
  if (flags & StdSizeButton) drop(size_);
  if (flags & StdDoItButton) drop(doIt_);
  if (flags & StdPinButton) drop(pin_);
  syncTitleBox();
  return true;
}

void PanelStandardWidgets::createButtons() {
  Canvas* c = panel_.canvas();
  const Palette& pal = panel_.getPalette();
  // Title buttons take the panel's colours, so that they sit in its title strip.
  auto restyle = [&pal](Button* b) {
    b->setPalette(pal);
    b->setcols(pal.get(Palette::WindowText), pal.windowShade(4));
  };
  if ((flags_ & StdPootButton) && !poot_) {
    auto* b = new PootButton(kTitleButtonSize, 0, c);
    restyle(b);
    poot_ = b;
  }
  if ((flags_ & StdSizeButton) && !size_) {
    auto* b = new SizeButton(panel_.getSizeState() == SizeMinimised, kTitleButtonSize, 0, c);
    restyle(b);
    size_ = b;
  }
  if ((flags_ & StdPinButton) && !pin_) {
    auto* b = new PinButton(kPinWidth, kPinHeight, c);
    restyle(b);
    b->setTransparentBackground(true);
    // A latching button reports its message + " on" / " off": "pin on" pins the panel.
    b->set_message("pin");
    b->set_state(panel_.isPinned() ? kButtonDown : kButtonUp, false);
    pin_ = b;
  }
  if ((flags_ & StdSettingsButton) && !settings_) {
    auto* b = new SettingsButton(kTitleButtonSize, 0, c);
    restyle(b);
    b->setTransparentBackground(true);
    settings_ = b;
  }
  if ((flags_ & StdDoItButton) && !doIt_) {
    doIt_ = new Button(UIString(kDoItLabelId).toWString(), StandardPanel::doItMsg, kDoItWidth,
                       kDoItHeight, 0, c);
  }
}

void PanelStandardWidgets::syncTitleBox() {
  // One box serves both title flags: editable while 0x40 is set, read-only with 0x20 alone,
  // gone with neither.
  const bool wanted = (flags_ & (StdTitleBox | StdEditableTitleBox)) != 0;
  const bool editable = (flags_ & StdEditableTitleBox) != 0;
  PanelTitleTextBox* box = title_.get();
  if (!wanted) {
    if (box) delete box;
    title_.reset();
  } else if (!box) {
    const auto width =
        static_cast<unsigned short>(std::clamp(maxTitleWidth(panel_, this), 0, 0xFFFF));
    title_ = new PanelTitleTextBox(panel_, width, kTitleBoxHeight, editable);
  } else if (box->isEditable() != editable) {
    box->setEditable(editable);
  }
}

void PanelStandardWidgets::showTitle(const WString& title) {
  if (PanelTitleTextBox* box = title_.get()) box->showTitle(title);
}

int PanelStandardWidgets::titleButtonsLeft(const StandardPanel& panel,
                                           const PanelStandardWidgets* widgets) {
  const PanelFrame f = panel.frame();
  int left = f.size.x - PanelGeometry::borderSize(f.border) - kTitleMargin;
  if (!widgets) return left;
  const Glob* buttons[] = {widgets->poot_.get(), widgets->size_.get(), widgets->pin_.get(),
                           widgets->settings_.get()};
  for (const Glob* g : buttons) {
    if (g && widgets->onPanel(g)) left = std::min(left, g->canvas()->rect().x0 - kTitleGap);
  }
  return left;
}

int PanelStandardWidgets::maxTitleWidth(const StandardPanel& panel,
                                        const PanelStandardWidgets* widgets) {
  const int left = PanelGeometry::borderSize(panel.getBorderStyle()) + kTitleMargin;
  return std::max(0, titleButtonsLeft(panel, widgets) - left);
}

void PanelStandardWidgets::position() {
  const PanelFrame frame = panel_.frame();
  const Kw::Box<int> strip = PanelGeometry::titleStrip(frame);
  auto centreY = [&strip](const Glob* g) { return strip.y0 + (strip.height() - g->height()) / 2; };
  auto moveTo = [this](Glob* g, int x, int y) {
    const Kw::Box<int>& r = g->canvas()->rect();
    if (onPanel(g) && (r.x0 != x || r.y0 != y)) g->translate_canvas(x - r.x0, y - r.y0);
  };

  // From the top-right corner leftwards: close, size, pin, settings, each against the nearest
  // earlier one (the size button against the close button only while that shows).
  const int corner = strip.x1 - kTitleMargin;
  Glob* poot = poot_.get();
  Glob* size = size_.get();
  Glob* pin = pin_.get();
  Glob* settings = settings_.get();
  auto leftOf = [corner](const Glob* anchor) {
    return anchor ? anchor->canvas()->rect().x0 - kTitleGap : corner;
  };
  if (poot) moveTo(poot, corner - poot->width(), centreY(poot));
  if (size) {
    const Glob* anchor = poot && poot->isVisible() ? poot : nullptr;
    moveTo(size, leftOf(anchor) - size->width(), centreY(size));
  }
  if (pin) {
    const Glob* anchor = size ? size : poot;
    moveTo(pin, leftOf(anchor) - pin->width(), centreY(pin));
  }
  if (settings) {
    const Glob* anchor = pin ? pin : size ? size : poot;
    moveTo(settings, leftOf(anchor) - settings->width(), centreY(settings));
  }
  if (Glob* box = titleBoxGlob()) {
    const int w = maxTitleWidth(panel_, this);
    const int x = PanelGeometry::borderSize(frame.border) + kTitleMargin;
    const Kw::Box<int>& r = box->canvas()->rect();
    if (r.x0 != x || r.y0 != centreY(box) || r.width() != w) {
      box->reshape_canvas(x, centreY(box), w, box->height());
    }
  }
  if (Glob* doIt = doIt_.get()) {
    const Kw::Box<int> bottom = PanelGeometry::bottomStrip(frame);
    moveTo(doIt, bottom.x1 - kTitleMargin - doIt->width(),
           bottom.y0 + (bottom.height() - doIt->height()) / 2);
  }
}

void PanelStandardWidgets::syncSizeButton() {
  SizeButton* b = size_.get();
  const bool minimised = panel_.getSizeState() == SizeMinimised;
  if (b && b->get_size() != minimised) b->set_size(minimised);
}

void PanelStandardWidgets::syncPinButton() {
  PinButton* b = pin_.get();
  const button_state shown = panel_.isPinned() ? kButtonDown : kButtonUp;
  if (b && b->get_state() != shown) b->set_state(shown, true);
}
