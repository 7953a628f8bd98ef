#pragma once
// The seam through which a standard panel gets its title box (flags 0x20 and 0x40) without
// depending on the text subsystem: the text subsystem installs a factory with
// StandardPanel::setTitleBoxFactory, and the panel talks to the box only through this
// interface.
//
// What the factory must do: create the box as a child Glob of `panel`'s canvas, `width` by
// `height` pixels, text margins 0 and 5, read-only unless `editable`, showing `panel`'s
// title; register `panel` for the box's callbacks "focus lost after a change" and "Enter",
// both with the message StandardPanel::titleChangedMsg; and return the interface (or null
// when it cannot). The panel positions the box, deletes the box's Glob when the flag is
// removed or the panel goes, and destroys this interface object first.
#include <functional>
#include <memory>

#include "platform/kw/String.h"

class Glob;
class StandardPanel;

class PanelTitleBox {
 public:
  virtual ~PanelTitleBox() = default;
  // The box itself; the panel checks it is still alive before every use.
  virtual Glob* glob() = 0;
  virtual WString text() const = 0;
  // Shows `text` without reporting it back as a change.
  virtual void setText(const WString& text) = 0;
};

using PanelTitleBoxFactory = std::function<std::unique_ptr<PanelTitleBox>(
    StandardPanel& panel, unsigned short width, unsigned short height, bool editable)>;
