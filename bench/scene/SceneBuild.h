#pragma once
// The benchmark scene S(N): a 1920 x 1080 screen whose one child, the panel, is 1920 wide and
// as tall as the grid needs (at least the screen), its top edge at the screen's top. Control i
// sits in the cell of column i % 10 and row i / 10 (180 x 28, 4 apart, 4 from the edges), and
// its kind cycles with i % 4: push button "Button i", check box "Check i" (clear), slider at
// 0.5, text box "Text i".
#include <string>
#include <vector>

#include "panels/StandardPanel.h"

class Button;
class RootGlob;

namespace scene {

constexpr int kScreenW = 1920;
constexpr int kScreenH = 1080;
constexpr int kCellW = 180;
constexpr int kCellH = 28;
constexpr int kGap = 4;
constexpr int kPitchX = kCellW + kGap;
constexpr int kPitchY = kCellH + kGap;
constexpr int kColumns = (kScreenW - kGap) / kPitchX;              // 10
constexpr int kVisibleRows = (kScreenH - kGap) / kPitchY;          // 33
constexpr int kVisibleChecks = (kVisibleRows * kColumns + 2) / 4;  // 83

enum class Kind { Button = 0, Check = 1, Slider = 2, Text = 3 };

inline Kind kindOf(int i) {
  return static_cast<Kind>(i % 4);
}
inline int cellLeft(int i) {
  return kGap + (i % kColumns) * kPitchX;
}
// Distance of the cell's top edge from the panel's top edge.
inline int cellTop(int i) {
  return kGap + (i / kColumns) * kPitchY;
}
inline int panelHeight(int n) {
  const int rows = (n + kColumns - 1) / kColumns;
  return std::max(kScreenH, kGap + rows * kPitchY);
}
std::wstring labelOf(int i);

// The panel: counts the toggle reports of its check boxes.
class ScenePanel : public StandardPanel {
 public:
  using StandardPanel::StandardPanel;
  int handleMessageEvent(const String& msg, Glob* sender) override;
  int toggles() const { return toggles_; }

 private:
  int toggles_ = 0;
};

enum class Placement { Direct, AddWidget };

struct Scene {
  ScenePanel* panel = nullptr;
  std::vector<Glob*> controls;
};

// Builds S(n) on `screen`: either each control made straight onto the panel's canvas at its
// cell, or made unattached and handed to the panel's addWidget from its top-left origin.
Scene build(RootGlob& screen, int n, Placement placement);
// Cells whose geometry or parent is not the one the scene defines.
int geometryMismatches(const Scene& s);
// Deletes the panel and with it every control.
void destroy(Scene& s);

// The screen y of a pixel row counted from the top.
inline int screenY(int row) {
  return kScreenH - 1 - row;
}

}  // namespace scene
