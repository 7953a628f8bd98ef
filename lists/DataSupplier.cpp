#include "lists/DataSupplier.h"

String DataSupplier::Text::getString() const {
  if (isWide_) return Kw::toUtf8(wide_);
  if (narrow_) return String(narrow_);
  return narrowCopy_;
}

DataSupplier::Text::operator const char*() const {
  if (isWide_) {
    if (!hasConverted_) {
      converted_ = Kw::toUtf8(wide_);
      hasConverted_ = true;
    }
    return converted_.c_str();
  }
  return narrow_ ? narrow_ : narrowCopy_.c_str();
}

const WString& DataSupplier::Text::getWString() const {
  if (!isWide_ && !hasConverted_) {
    wide_ = Kw::toWide(narrow_ ? narrow_ : narrowCopy_.c_str());
    hasConverted_ = true;
  }
  return wide_;
}
