#include "lists/DataColumn.h"

#include <algorithm>

#include "platform/misc/Diagnostics.h"

DataColumn::DataColumn(unsigned short width, TextAlignment alignment) : alignment_(alignment) {
  setWidth(width);
}

void DataColumn::setWidth(unsigned short width) {
  width_ = std::max(width, minWidth_);
}

void DataColumn::setMinWidth(unsigned short width) {
  minWidth_ = std::max(width, kSmallestWidth);
  width_ = std::max(width_, minWidth_);
}

bool DataColumn::setLineHeight(unsigned short height) {
  if (height < kMinLineHeight || height > kMaxLineHeight) {
    diagWarning("DataColumn: line height " + std::to_string(height) + " refused\n");
    return false;
  }
  lineHeight_ = height;
  return true;
}
