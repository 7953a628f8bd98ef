#include "gallery/ClipSupplier.h"

void ClipSupplier::setTags(const std::map<unsigned int, bool>& tags) {
  for (const auto& [row, on] : tags) {
    if (on)
      tags_.insert(row);
    else
      tags_.erase(row);
  }
}

WString ClipSupplier::contextString(const XY<int>& cell) {
  if (cell.x != 0) return WString();
  return L"Clip " + std::to_wstring(cell.y + 1) + L" of " + std::to_wstring(getSize()) +
         L": double-click to rename, drag to reorder";
}

void ClipSupplier::getFieldChoices(const XY<int>& cell, std::vector<WString>& choices) {
  if (String(getFieldName(static_cast<unsigned>(std::max(0, cell.x)))) != "tags") return;
  choices = {L"interview", L"b-roll", L"music", L"archive", L"voice-over"};
}
