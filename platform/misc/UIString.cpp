#include "platform/misc/UIString.h"

#include "platform/misc/ResourceStrings.h"

UIString::UIString(const char* utf8) : text_(String(utf8 != nullptr ? utf8 : "")) {}

UIString::UIString(const wchar_t* wide) : text_(WString(wide != nullptr ? wide : L"")) {}

unsigned int UIString::id() const {
  const unsigned int* id = std::get_if<unsigned int>(&text_);
  return id != nullptr ? *id : 0;
}

WString UIString::toWString() const {
  return toWString(resourceStrings());
}

WString UIString::toWString(const ResourceStrings& table) const {
  if (const auto* narrow = std::get_if<String>(&text_)) return Kw::toWide(*narrow);
  if (const auto* wide = std::get_if<WString>(&text_)) return *wide;
  return table.lookup(std::get<unsigned int>(text_));
}

String UIString::toString() const {
  return toString(resourceStrings());
}

String UIString::toString(const ResourceStrings& table) const {
  if (const auto* narrow = std::get_if<String>(&text_)) return *narrow;
  return Kw::toUtf8(toWString(table));
}
