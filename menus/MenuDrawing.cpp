// How a pop-up menu paints itself: the background with its title and icon strips, then each
// visible row (its face, group glyph, text and right-aligned text or choice), all through the
// menu look.
#include "menus/Menu.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/MenuLook.h"

Glib::FontPtr Menu::fontFor(const MenuItem& item) const {
  if (item.getFont() == Glib::FontDesc()) return font_;
  return Glib::fonts().get(item.getFont());
}

void Menu::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  drawBackground(p);
  p.pushClip(Kw::Box<int>(0, footHeight(), rowsRight(), rowsTop()));
  for (const VisibleMenuItem& row : visible_) drawMenuItem(p, row);
  p.popClip();
  Glib::MenuLook(getPalette()).frame(p);
}

void Menu::drawBackground(Glib::Painter& p) {
  const Glib::MenuLook look(getPalette());
  look.background(p, p.bounds(), hasBaseColour_ ? baseColour_ : look.face());
  const int top = rowsTop();
  if (titleMode_ == kTitleMode) {
    look.titleStrip(p, Kw::Box<int>(0, height() - kTitleStripHeight, width(), height()), title_,
                    titleColour_, *font_);
  }
  if (iconicCount_ > 0) look.iconStrip(p, Kw::Box<int>(0, top, width(), top + kIconStripHeight));
}

void Menu::drawMenuItem(Glib::Painter& p, int index) {
  for (const VisibleMenuItem& row : visible_) {
    if (row.index == index) drawMenuItem(p, row);
  }
}

void Menu::drawMenuItem(Glib::Painter& p, const VisibleMenuItem& row) {
  const MenuItem& it = items_[row.index];
  const Glib::MenuLook look(getPalette());
  const bool lit = row.index == highlighted_;
  look.row(p, row.area, getItemBackCol(row.index), it.isGroupHeader(), lit);
  if (it.isGroupHeader()) {
    look.groupGlyph(p, row.area, it.type() == ExpandedGroupItem,
                    look.rowText(it.fCol(), lit, true));
  }
  drawMenuItemText(p, row);
  drawRightAlignedText(p, row);
}

void Menu::drawMenuItemText(Glib::Painter& p, const VisibleMenuItem& row) {
  const MenuItem& it = items_[row.index];
  const Glib::MenuLook look(getPalette());
  const bool lit = row.index == highlighted_;
  const Colour c = look.rowText(it.fCol(), lit, it.getActive() || it.isGroupHeader());
  const Kw::Box<int> box(row.area.x0 + kGlyphColumn, row.area.y0, row.area.x1 - kRightMargin,
                         row.area.y1);
  p.text(it.getDisplayString(), box, *fontFor(it), c, alignment_, getTextStyle(row.index));
}

void Menu::drawRightAlignedText(Glib::Painter& p, const VisibleMenuItem& row) {
  const MenuItem& it = items_[row.index];
  const bool choice = !it.options().empty();
  const WString text = choice ? it.getCurOptionStr() : it.getRightAlignedText();
  if (text.empty()) return;
  const Glib::MenuLook look(getPalette());
  const bool lit = row.index == highlighted_;
  const Colour c = look.rowText(it.fCol(), lit, it.getActive());
  Kw::Box<int> box(row.area.x0 + kGlyphColumn, row.area.y0, row.area.x1 - kRightMargin,
                   row.area.y1);
  if (choice) {
    look.choiceMark(p, box, c);
    box.x1 -= kChoiceMarkRoom;
  }
  p.text(text, box, *fontFor(it), c, TextAlignment::Right, getTextStyle(row.index));
}

Glib::TextStyles::TextStyle Menu::getTextStyle(int) const {
  return Glib::TextStyles::Normal;
}

Colour Menu::getItemBackCol(int index) const {
  return items_[index].col();
}
