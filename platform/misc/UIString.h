#pragma once
// A user-interface text given either literally (UTF-8 or wide) or by its id in the resource
// string table. A resource text is looked up each time it is asked for, so a table loaded
// later, or another language, is picked up.
#include <variant>

#include "platform/kw/String.h"

class ResourceStrings;

class UIString {
 public:
  UIString() = default;
  // A null pointer gives the empty text.
  UIString(const char* utf8);
  UIString(const String& utf8) : text_(utf8) {}
  UIString(const wchar_t* wide);
  UIString(const WString& wide) : text_(wide) {}
  explicit UIString(unsigned int resourceId) : text_(resourceId) {}

  bool isResource() const { return std::holds_alternative<unsigned int>(text_); }
  // The resource id; 0 for a literal text.
  unsigned int id() const;

  // The text; a resource id is looked up in resourceStrings(), or in the given table.
  // Invalid UTF-8 in a narrow literal becomes U+FFFD.
  WString toWString() const;
  WString toWString(const ResourceStrings& table) const;
  // The text as UTF-8; a narrow literal is returned exactly as given.
  String toString() const;
  String toString(const ResourceStrings& table) const;

  // Same kind and same literal text or id.
  bool operator==(const UIString& other) const = default;

 private:
  std::variant<String, WString, unsigned int> text_;
};
